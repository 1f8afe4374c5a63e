// Telling a group of objects from a single one takes a call that EFL still marks as beta.
#define EFL_BETA_API_SUPPORT

#include "TipPage.h"

#include <Ecore_Evas.h>
#include <Eo.h>
#include <gmock/gmock.h>
#include <malloc.h>

#include <random>

namespace {

/// A pager of fifteen pages in long use. Nothing is drawn meanwhile, which would take most of the time.
class PagerSoak : public PageSlideViewTest {
protected:
    PagerSoak() {
        Ecore_Evas* frame = ecore_evas_ecore_evas_get(canvas());
        ecore_evas_manual_render_set(frame, EINA_TRUE);
        beforeIdle_ = ecore_idle_enterer_add(
            [](void* self) -> Eina_Bool {
                ++static_cast<PagerSoak*>(self)->turns_;
                evas_norender(static_cast<PagerSoak*>(self)->canvas());
                return ECORE_CALLBACK_RENEW;
            },
            this);
        naviframe_.push(new TellingView("list", story_), nullptr, nullptr);
        test_ui::runFor(0.5);
    }
    ~PagerSoak() override { ecore_idle_enterer_del(beforeIdle_); }

    Evas* canvas() { return evas_object_evas_get(window()); }
    /// Opens a pager of empty pages at `first`, pushed or inserted.
    Pager* openEmpty(int first, bool onTop) {
        pages_.clear();
        story_.clear();
        for (int i = 0; i < 15; ++i)
            make(std::to_string(i), Page::Filling::Nothing);
        return open(first, 15, onTop);
    }
    /// All Evas objects, also those inside others.
    int objects() {
        int count = 0;
        for (auto* each = evas_object_bottom_get(canvas()); each; each = evas_object_above_get(each))
            count += 1 + objectsInside(each);
        return count;
    }
    static int objectsInside(const Evas_Object* object) {
        if (!efl_isa(object, EFL_CANVAS_GROUP_CLASS))
            return 0;
        int count = 0;
        Eina_List* members = evas_object_smart_members_get(object);
        void* each = nullptr;
        EINA_LIST_FREE(members, each)
        count += 1 + objectsInside(static_cast<Evas_Object*>(each));
        return count;
    }
    /// How often the main loop finds something to do in a second; timers and animators that were left behind add to it.
    int turnsInASecond() {
        const int before = turns_;
        test_ui::runFor(1.0);
        return turns_ - before;
    }
    static size_t memory() { return mallinfo2().uordblks; }

    std::mt19937 random_{20150401};
    int pick(int from, int to) { return std::uniform_int_distribution<int>(from, to)(random_); }

private:
    Ecore_Idle_Enterer* beforeIdle_;
    int turns_ = 0;
};

TEST_F(PagerSoak, AThousandOpeningsAndClosingsLeaveNothingBehind) {
    const auto openAndClose = [this](int times) {
        for (int i = 0; i < times; ++i) {
            const int first = pick(0, 14);
            Pager* pager = openEmpty(first, i % 2);
            if (pick(0, 1))
                test_ui::runFor(0.01 * pick(1, 40));
            ASSERT_EQ(first, pager->inView());
            if (pick(0, 3)) {
                evas_object_del(pager->getEvasObj());
                test_ui::runFor(0.01);
            } else {
                naviframe_.back();
                test_ui::runFor(0.6);
            }
            ASSERT_STREQ("list", naviframe_.getTopView()->getClassName());
        }
        test_ui::runFor(1.0);
    };
    openAndClose(50);
    const int objectsBefore = objects(), turnsBefore = turnsInASecond();
    const size_t memoryBefore = memory();
    openAndClose(1000);
    EXPECT_EQ(objectsBefore, objects());
    EXPECT_NEAR(turnsBefore, turnsInASecond(), 10);
    // EFL itself keeps sixteen bytes of each of its objects that has others inside, and a pager has some twenty.
    EXPECT_LT(memory(), memoryBefore + 1000 * 1500);
}

TEST_F(PagerSoak, TenThousandSwipesEndOnAPageThatWasToldEachTime) {
    Pager* pager = openEmpty(7, true);
    Movements movements;
    movements.listenTo(*pager);
    const int objectsBefore = objects(), turnsBefore = turnsInASecond();
    const size_t memoryBefore = memory();
    Story heard;
    for (int i = 0; i < 10000; ++i) {
        const int from = pick(50, 670), to = pick(50, 670), steps = pick(1, 5);
        screen().press({from, pick(200, 1200)});
        for (int step = 1; step <= steps; ++step) {
            test_ui::runFor(0.001 * pick(5, 30));
            screen().moveTo({from + (to - from) * step / steps, pick(200, 1200)});
        }
        screen().lift();
        test_ui::runFor(i % 20 == 19 ? 1.5 : 0.001 * pick(1, 200));
        for (std::string& line : movements.heard())
            heard.push_back(std::move(line));
        if (i % 20 != 19 || heard.empty())
            continue;
        for (size_t line = 0; line < heard.size(); ++line)
            ASSERT_TRUE(heard[line].starts_with(line % 2 ? "stop" : "start")) << "at swipe " << i;
        ASSERT_EQ("stop " + std::to_string(pager->inView()), heard.back()) << "at swipe " << i;
        ASSERT_EQ(0, test_ui::geometry(pages_[static_cast<size_t>(pager->inView())]->getEvasObj()).x);
        ASSERT_FALSE(test_ui::clock::isAnimating());
        heard.clear();
    }
    EXPECT_EQ(objectsBefore, objects());
    EXPECT_NEAR(turnsBefore, turnsInASecond(), 10);
    EXPECT_LT(memory(), memoryBefore + 100000);
}

}  // namespace
