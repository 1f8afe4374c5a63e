#include "PagerTest.h"
#include "TimerCalls.h"
#include "ui/LongUse.h"

#include <fstream>
#include <random>

using testing::EndsWith;
using testing::IsEmpty;

namespace {

constexpr unsigned int seed = 20150401;

}  // namespace

/// The pager in long use, with pages of every kind. The parameter is the language.
class Soak : public PagerTest, public testing::WithParamInterface<std::string> {
protected:
    Soak() {
        isDrawn_ = true;  // but for what LongUse leaves out
        setLanguage(GetParam());
        drawSequence(3, {0, 1});
        for (const char* name : {"a_russia_01.png", "b_01.png", "b_02.png", "plain.png"})
            drawPicture(name);
        drawPicture("tall.png", 716, 900);
        std::ofstream(picturePath("broken.png")) << "no picture";
        writeTips({tip("a_01.png"), tip("plain.png"), tip("tall.png"), tip("broken.png"), tip("b_01.png"),
                   tip("none.png", "<a href=app>Open</a>"), tip("a_01.png")});
        startEmpty();
        naviframe().push(new OtherView, nullptr, nullptr);
        settle();
        use_.emplace(running().window());
        toolkit_.log().expect("Failed to load image");
    }

    int pick(int from, int to) { return std::uniform_int_distribution<int>(from, to)(random_); }
    bool pickWhether() { return pick(0, 1) == 1; }

    /// Has the pager somewhere between its opening and its rest.
    void useForAWhile() {
        switch (pick(0, 5)) {
        case 0:
            break;
        case 1:
            test_ui::runFor(0.01 * pick(1, 40));
            break;
        case 2:
            test_ui::runFor(0.1 * pick(5, 90));
            break;
        case 3:
            test_ui::swipeAtRandom(screen(), random_);
            test_ui::runFor(0.001 * pick(1, 200));
            break;
        case 4:
            test_ui::runFor(0.1 * pick(1, 10));
            screen().press({pick(300, 400), 400});
            test_ui::runFor(0.05);
            screen().moveTo({pick(100, 650), 400});
            test_ui::runFor(0.05);
            break;
        default:
            test_ui::runFor(0.1 * pick(1, 10));
            test_ui::inMainLoop([&] { pager().showContentsPage(pick(0, menus - 1)); });
            test_ui::runFor(0.1 * pick(0, 40));
        }
    }
    void closeSomehow() {
        if (pickWhether())
            test_ui::inMainLoop([&] { closePager(); });
        else
            test_ui::inMainLoop([&] { elm_object_item_del(pager().getNaviItem()); });
        test_ui::runFor(0.01);
        screen().lift();
        test_ui::runFor(0.6);
    }
    void openAndClose() {
        const int menu = pick(0, menus - 1);
        push(menu, pickWhether());
        ASSERT_EQ(pageInView(), menu);
        useForAWhile();
        closeSomehow();
        ASSERT_EQ(topView(), "OtherView");
        const auto themed = calls::steps({"theme"});
        ASSERT_EQ(std::count(themed.begin(), themed.end(), "theme +"), menus);
        ASSERT_EQ(std::count(themed.begin(), themed.end(), "theme -"), menus);
        forgetCalls();
    }
    /// The page in view stands still at its place, and was the last one that was displayed.
    void expectTheRightPage() {
        const int place = pageInView();
        ASSERT_EQ(test_ui::geometry(page(place)).x, 0);
        for (const std::string& line : calls::wholeStory())
            if (line.find(": info show") != std::string::npos)
                displayed_ = line;
        ASSERT_THAT(displayed_, EndsWith(" page " + std::to_string(place) + ": info show"));
        if (GetParam() == "en_US.UTF-8") {
            ASSERT_EQ(title(), "Tips " + std::to_string(place + 1) + "/" + std::to_string(menus));
        }
    }

    /// What the tests note of the application's calls is not what it leaves behind.
    static void forgetCalls() {
        calls::forget();
        calls::newTimers();
    }

    static constexpr int menus = 7;
    std::string displayed_;
    std::mt19937 random_{seed};
    std::optional<test_ui::LongUse> use_;
};

INSTANTIATE_TEST_SUITE_P(In, Soak, testing::Values("en_US.UTF-8", "ru_RU.UTF-8", "ar_AE.UTF-8"),
                         [](const auto& language) { return language.param.substr(0, 2); });

TEST_P(Soak, OfOpeningsAndClosingsLeavesNothingBehind) {
    const int openings = test_ui::timesOf(10, 1000);
    SCOPED_TRACE("seed " + std::to_string(seed));
    for (int time = 0; time < test_ui::timesOf(5, 100); ++time)
        ASSERT_NO_FATAL_FAILURE(openAndClose()) << "at opening " << time;
    test_ui::runFor(1);
    newLog();
    const int objectsBefore = use_->objects(), turnsBefore = use_->turnsInASecond();
    const std::size_t memoryBefore = test_ui::LongUse::memory();
    for (int time = 0; time < openings; ++time)
        ASSERT_NO_FATAL_FAILURE(openAndClose()) << "at opening " << time;
    test_ui::runFor(1);
    EXPECT_EQ(use_->objects(), objectsBefore);
    EXPECT_NEAR(use_->turnsInASecond(), turnsBefore, 10);
    const auto grown = static_cast<long>(test_ui::LongUse::memory()) - static_cast<long>(memoryBefore);
    // EFL itself keeps sixteen bytes of each of its objects that has others inside.
    EXPECT_LT(grown, 100000 + 4000L * openings);
}

TEST_P(Soak, OfSwipesEndsOnAPageThatIsDisplayed) {
    const int swipes = test_ui::timesOf(80, 10000);
    SCOPED_TRACE("seed " + std::to_string(seed));
    open(3);
    test_ui::runFor(2);
    newLog();
    int objectsBefore = 0, turnsBefore = 0;
    std::size_t memoryBefore = 0;
    const int warmUp = 40;
    for (int time = 0; time < warmUp + swipes; ++time) {
        const bool rests = time % 20 == 19;
        test_ui::swipeAtRandom(screen(), random_);
        test_ui::runFor(rests ? 1.5 : 0.001 * pick(1, 200));
        if (!rests)
            continue;
        ASSERT_NO_FATAL_FAILURE(expectTheRightPage()) << "at swipe " << time;
        forgetCalls();
        if (time + 1 != warmUp)
            continue;
        test_ui::runFor(15);
        objectsBefore = use_->objects();
        turnsBefore = use_->turnsInASecond();
        memoryBefore = test_ui::LongUse::memory();
    }
    test_ui::runFor(15);
    // It differs by one with where the pager has come to rest.
    EXPECT_NEAR(use_->objects(), objectsBefore, menus);
    EXPECT_NEAR(use_->turnsInASecond(), turnsBefore, 10);
    const auto grown = static_cast<long>(test_ui::LongUse::memory()) - static_cast<long>(memoryBefore);
    // Some bytes stay with each display of a page, though no object.
    EXPECT_LT(grown, 100000 + 500L * swipes);
    EXPECT_THAT(newErrors(), IsEmpty());
}
