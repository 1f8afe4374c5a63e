#include "TipPage.h"

#include <gmock/gmock.h>

namespace {

/// How a pager ends. By its Evas object it goes at once, by a pop when it has moved out.
class PagerEnd : public TipPagerTest {
protected:
    PagerEnd() {
        naviframe_.push(new TellingView("list", story_), nullptr, nullptr);
        test_ui::runFor(0.5);
    }
    void pop() {
        test_ui::inMainLoop([this] { elm_naviframe_item_pop(naviframe_.getEvasObj()); });
    }
    std::string top() const { return naviframe_.getTopView()->getClassName(); }
    unsigned int levels() const {
        Eina_List* items = elm_naviframe_items_get(naviframe_.getEvasObj());
        const unsigned int count = eina_list_count(items);
        eina_list_free(items);
        return count;
    }
    /// Lets everything come to rest, and asserts that the list is what is left, alive to a touch.
    void expectOnlyTheList() {
        test_ui::runFor(2.0);
        EXPECT_EQ("list", top());
        EXPECT_EQ(tips_.size(), static_cast<size_t>(std::count_if(story_.begin(), story_.end(), isDeletion)));
        test_ui::runFor(1.0);
        EXPECT_FALSE(test_ui::clock::isAnimating());
        EXPECT_FALSE(evas_object_freeze_events_get(naviframe_.getTopView()->getEvasObj()));
    }
    static bool isDeletion(const std::string& line) { return line.ends_with(": deleted"); }
};

TEST_F(PagerEnd, ComesWhenItHasMovedInIfItWasPoppedBefore) {
    openTips(2);
    test_ui::runFor(0.1);
    pop();
    EXPECT_EQ(2U, levels());
    EXPECT_EQ("list", top());
    expectOnlyTheList();
}

TEST_F(PagerEnd, LetsAViewThatIsPushedMeanwhileStay) {
    openTips(2);
    test_ui::runFor(0.1);
    pop();
    naviframe_.push(new TellingView("next", story_), nullptr, nullptr);
    EXPECT_EQ("next", top());
    test_ui::runFor(2.0);
    EXPECT_EQ("next", top());
    EXPECT_EQ(2U, levels());
    EXPECT_EQ(tips_.size(), static_cast<size_t>(std::count_if(story_.begin(), story_.end(), isDeletion)));
}

TEST_F(PagerEnd, ComesOnceFromTwoPopsWhileItMovesIn) {
    openTips(2);
    test_ui::runFor(0.1);
    pop();
    pop();
    expectOnlyTheList();
    EXPECT_FALSE(test_ui::hasEnded());
}

TEST_F(PagerEnd, ComesFromTheBackKeyWhileItMovesIn) {
    screen().key("Shift_L");
    openTips(2);
    screen().key("XF86Back");
    EXPECT_EQ(2U, levels());
    expectOnlyTheList();
}

TEST_F(PagerEnd, ComesFromTwoPressesOfTheBackKeyWhileItMovesInAndLeavesTheList) {
    screen().key("Shift_L");
    openTips(2);
    screen().key("Escape");
    screen().key("Escape");
    expectOnlyTheList();
    EXPECT_FALSE(test_ui::hasEnded());
}

/// Seconds after the opening: before the first page is filled, between it and the others, while they move in.
class PagerEndAfter : public PagerEnd, public testing::WithParamInterface<double> {};

TEST_P(PagerEndAfter, LeavesNoTimerOfItBehind) {
    app_assist::WView* pager = openTips(2);
    if (GetParam() > 0)
        test_ui::runFor(GetParam());
    evas_object_del(pager->getEvasObj());
    expectOnlyTheList();
}

TEST_P(PagerEndAfter, ComesFromAPop) {
    openTips(2);
    if (GetParam() > 0)
        test_ui::runFor(GetParam());
    pop();
    expectOnlyTheList();
}

TEST_P(PagerEndAfter, ComesWithTheWindow) {
    openTips(2);
    if (GetParam() > 0)
        test_ui::runFor(GetParam());
    evas_object_del(window());
    test_ui::runFor(2.0);
    EXPECT_EQ(nullptr, naviframe_.getTopView());
    EXPECT_EQ(6, std::count_if(story_.begin(), story_.end(), isDeletion));
}

INSTANTIATE_TEST_SUITE_P(Times, PagerEndAfter, testing::Values(0.0, 0.05, 0.3, 1.0));

/// The ways to go while something is going on: at once, by a pop, with the window.
class PagerEndAmid : public PagerEnd, public testing::WithParamInterface<int> {
protected:
    void end(app_assist::WView* pager) {
        if (GetParam() == 0)
            evas_object_del(pager->getEvasObj());
        else if (GetParam() == 1)
            elm_naviframe_item_pop(naviframe_.getEvasObj());
        else
            evas_object_del(window());
    }
    void expectTheEnd() {
        if (GetParam() < 2) {
            expectOnlyTheList();
            return;
        }
        test_ui::runFor(2.0);
        EXPECT_EQ(nullptr, naviframe_.getTopView());
    }
};

TEST_P(PagerEndAmid, ADragIsHarmless) {
    Pager* pager = openTips(2);
    test_ui::runFor(1.0);
    screen().press({600, 900});
    for (int x = 600; x > 300; x -= 30) {
        test_ui::runFor(0.02);
        screen().moveTo({x, 900});
    }
    test_ui::inMainLoop([&] { end(pager); });
    test_ui::runFor(0.05);
    if (GetParam() < 2)
        screen().lift();
    expectTheEnd();
}

TEST_P(PagerEndAmid, AHeldFingerIsHarmless) {
    Pager* pager = openTips(2);
    test_ui::runFor(1.0);
    screen().press({300, 900});
    test_ui::inMainLoop([&] { end(pager); });
    test_ui::runFor(2.0);
    if (GetParam() < 2)
        screen().lift();
    expectTheEnd();
}

TEST_P(PagerEndAmid, ABounceIsHarmless) {
    Pager* pager = openTips(0);
    test_ui::runFor(1.0);
    swipeRight();
    test_ui::runFor(0.1);
    test_ui::inMainLoop([&] { end(pager); });
    expectTheEnd();
}

TEST_P(PagerEndAmid, ATurnIsHarmless) {
    Pager* pager = openTips(2);
    test_ui::runFor(1.0);
    swipeLeft();
    test_ui::runFor(0.1);
    test_ui::inMainLoop([&] { end(pager); });
    expectTheEnd();
}

TEST_P(PagerEndAmid, TheBeginningOfAMovementIsHarmless) {
    Pager* pager = openTips(0);
    test_ui::runFor(1.0);
    movements_.atStart = [&] { end(pager); };
    swipeLeft();
    EXPECT_EQ(nullptr, movements_.atStart);
    expectTheEnd();
}

TEST_P(PagerEndAmid, TheEndOfATurnIsHarmless) {
    Pager* pager = openTips(0);
    test_ui::runFor(1.0);
    movements_.atStop = [&] { end(pager); };
    swipeLeft();
    expectTheEnd();
    EXPECT_EQ(nullptr, movements_.atStop);
}

TEST_P(PagerEndAmid, TheEndOfABounceIsHarmless) {
    Pager* pager = openTips(0);
    test_ui::runFor(1.0);
    movements_.atStop = [&] { end(pager); };
    swipeRight();
    expectTheEnd();
    EXPECT_EQ(nullptr, movements_.atStop);
}

TEST_P(PagerEndAmid, TheEndOfAMovementByAFingerIsHarmless) {
    Pager* pager = openTips(0);
    test_ui::runFor(1.0);
    swipeLeft();
    test_ui::runFor(0.1);
    movements_.atStop = [&] { end(pager); };
    screen().press({400, 900});
    EXPECT_EQ(nullptr, movements_.atStop);
    if (GetParam() < 2)
        screen().lift();
    expectTheEnd();
}

TEST_P(PagerEndAmid, WhatItsPagesDoWithItIsNotHeard) {
    Pager* pager = openTips(0);
    test_ui::runFor(1.0);
    swipeLeft();
    test_ui::runFor(0.1);
    EXPECT_THAT(heard(), testing::ElementsAre("start"));
    tip(1).inDestroy = [pager] {
        elm_scroller_page_show(pager->getScroller(), 3, 0);
        elm_scroller_page_bring_in(pager->getScroller(), 0, 0);
    };
    if (GetParam() == 0)
        evas_object_del(pager->getEvasObj());
    else
        evas_object_del(window());
    EXPECT_THAT(heard(), testing::IsEmpty());
}

INSTANTIATE_TEST_SUITE_P(Ways, PagerEndAmid, testing::Range(0, 3));

}  // namespace
