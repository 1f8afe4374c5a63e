#include "TipPage.h"

#include "ui/LongUse.h"

#include <gmock/gmock.h>

#include <random>

namespace {

/// A pager of fifteen pages in long use.
class PagerSoak : public PageSlideViewTest {
protected:
    PagerSoak() {
        naviframe_.push(new TellingView("list", story_), nullptr, nullptr);
        test_ui::runFor(0.5);
    }

    /// Opens a pager of empty pages at `first`, pushed or inserted.
    Pager* openEmpty(int first, bool onTop) {
        pages_.clear();
        story_.clear();
        for (int i = 0; i < 15; ++i)
            make(std::to_string(i), Page::Filling::Nothing);
        return open(first, 15, onTop);
    }
    std::mt19937 random_{20150401};
    int pick(int from, int to) { return std::uniform_int_distribution<int>(from, to)(random_); }

    test_ui::LongUse use_{window()};
};

TEST_F(PagerSoak, OfOpeningsAndClosingsLeavesNothingBehind) {
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
    const int openings = test_ui::timesOf(50, 1000);
    openAndClose(50);
    const int objectsBefore = use_.objects(), turnsBefore = use_.turnsInASecond();
    const size_t memoryBefore = use_.memory();
    openAndClose(openings);
    EXPECT_EQ(objectsBefore, use_.objects());
    EXPECT_NEAR(turnsBefore, use_.turnsInASecond(), 10);
    // EFL itself keeps sixteen bytes of each of its objects that has others inside, and a pager has some twenty.
    EXPECT_LT(use_.memory(), memoryBefore + 100000 + static_cast<size_t>(openings) * 1500);
}

TEST_F(PagerSoak, OfSwipesEndsOnAPageThatWasToldEachTime) {
    Pager* pager = openEmpty(7, true);
    Movements movements;
    movements.listenTo(*pager);
    const int objectsBefore = use_.objects(), turnsBefore = use_.turnsInASecond();
    const size_t memoryBefore = use_.memory();
    Story heard;
    const int swipes = test_ui::timesOf(400, 10000);
    for (int i = 0; i < swipes; ++i) {
        test_ui::swipeAtRandom(screen(), random_);
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
    EXPECT_EQ(objectsBefore, use_.objects());
    EXPECT_NEAR(turnsBefore, use_.turnsInASecond(), 10);
    EXPECT_LT(use_.memory(), memoryBefore + 100000);
}

}  // namespace
