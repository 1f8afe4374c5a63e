#include "PageMovementTest.h"

#include <gmock/gmock.h>

using testing::ElementsAre;

namespace {

TEST_F(PageMovement, ATurnedPageStartsAndStopsOnce) {
    listenTo(1);
    swipeLeft();
    test_ui::runFor(2.0);
    EXPECT_THAT(heard(), ElementsAre("start", "stop 2"));
    swipeRight();
    test_ui::runFor(2.0);
    EXPECT_THAT(heard(), ElementsAre("start", "stop 1"));
}

TEST_F(PageMovement, ASlowTurnStartsAndStopsOnce) {
    listenTo(1);
    screen().swipe({700, 700}, {100, 700}, 1.5);
    test_ui::runFor(2.0);
    EXPECT_THAT(heard(), ElementsAre("start", "stop 2"));
}

TEST_F(PageMovement, APageThatSnapsBackStartsAndStopsOnce) {
    listenTo(1);
    screen().swipe({400, 700}, {300, 700}, 1.0);
    test_ui::runFor(2.0);
    EXPECT_THAT(heard(), ElementsAre("start", "stop 1"));
}

class BounceAtAnEnd : public PageMovement, public testing::WithParamInterface<int> {
protected:
    test_ui::Rect page() const { return test_ui::geometry(pages_[static_cast<size_t>(GetParam())]->getEvasObj()); }
    /// Pulls away from the end, where there is no page.
    void pull(double seconds) {
        const test_ui::Point left{100, 700}, right{600, 700};
        GetParam() == 0 ? screen().swipe(left, right, seconds) : screen().swipe(right, left, seconds);
    }
    std::string stop() const { return "stop " + std::to_string(GetParam()); }
};

TEST_P(BounceAtAnEnd, IsSeenStartsAndStopsOnceAndComesToRest) {
    listenTo(GetParam());
    for (const double seconds : {0.06, 0.15, 1.5}) {
        pull(seconds);
        EXPECT_GT(std::abs(page().x), 50) << "pulled away from the edge";
        test_ui::runFor(0.05);
        EXPECT_NE(0, page().x) << "on its way back";
        test_ui::runFor(1.0);
        EXPECT_EQ(0, page().x);
        EXPECT_THAT(heard(), ElementsAre("start", stop())) << seconds;
        EXPECT_EQ(0, framesInASecond());
        EXPECT_THAT(heard(), ElementsAre());
    }
}

TEST_P(BounceAtAnEnd, FollowedByATurnIsTwoMovements) {
    listenTo(GetParam());
    pull(0.15);
    test_ui::runFor(0.1);
    GetParam() == 0 ? swipeLeft() : swipeRight();
    test_ui::runFor(2.0);
    EXPECT_THAT(heard(), ElementsAre("start", stop(), "start", GetParam() == 0 ? "stop 1" : "stop 3"));
    EXPECT_EQ(0, framesInASecond());
}

TEST_P(BounceAtAnEnd, IsHeldByAFingerAndComesToRestWhenThatLifts) {
    listenTo(GetParam());
    pull(0.15);
    test_ui::runFor(0.1);
    screen().press({400, 700});
    test_ui::runFor(1.0);
    EXPECT_THAT(heard(), ElementsAre("start", stop()));
    EXPECT_EQ(0, framesInASecond());
    screen().lift();
    test_ui::runFor(1.0);
    EXPECT_EQ(0, page().x);
    EXPECT_EQ(0, framesInASecond());
}

TEST_P(BounceAtAnEnd, ComesToRestThoughAFingerLiesBesideThePager) {
    evas_object_resize(naviframe_.getEvasObj(), 720, 1000);
    listenTo(GetParam());
    pull(0.15);
    screen().press({400, 1200});
    test_ui::runFor(1.0);
    screen().lift();
    test_ui::runFor(0.1);
    EXPECT_THAT(heard(), ElementsAre("start", stop()));
    EXPECT_EQ(0, page().x);
    EXPECT_EQ(0, framesInASecond());
}

INSTANTIATE_TEST_SUITE_P(Ends, BounceAtAnEnd, testing::Values(0, 4));

TEST_F(PageMovement, ATapOnAMovingPageStopsItAndItsReleaseMovesItOn) {
    listenTo(0);
    swipeLeft();
    test_ui::runFor(0.1);
    screen().tap({400, 700});
    test_ui::runFor(2.0);
    EXPECT_THAT(heard(), ElementsAre("start", "stop 1", "start", "stop 1"));
    EXPECT_EQ(0, framesInASecond());
}

TEST_F(PageMovement, TwoQuickFlicksAreTwoMovements) {
    listenTo(0);
    swipeLeft();
    test_ui::runFor(0.2);
    swipeLeft();
    test_ui::runFor(2.0);
    EXPECT_THAT(heard(), ElementsAre("start", "stop 1", "start", "stop 2"));
}

TEST_F(PageMovement, ABringInStartsAndStopsOnce) {
    listenTo(0);
    test_ui::inMainLoop([this] { elm_scroller_page_bring_in(pager_->getScroller(), 4, 0); });
    test_ui::runFor(2.0);
    EXPECT_THAT(heard(), ElementsAre("start", "stop 4"));
    test_ui::inMainLoop([this] { elm_scroller_page_bring_in(pager_->getScroller(), 4, 0); });
    test_ui::runFor(2.0);
    EXPECT_THAT(heard(), ElementsAre());
}

TEST_F(PageMovement, ASwipeTakesOverFromABringIn) {
    listenTo(0);
    test_ui::inMainLoop([this] { elm_scroller_page_bring_in(pager_->getScroller(), 1, 0); });
    test_ui::runFor(0.4);
    swipeLeft();
    test_ui::runFor(2.0);
    EXPECT_THAT(heard(), ElementsAre("start", "stop 1", "start", "stop 2"));
}

TEST_F(PageMovement, APageThatIsShownAtOnceIsNoMovementAndEndsOneThatRuns) {
    listenTo(0);
    pager_->showPage(2, false);
    test_ui::runFor(1.0);
    EXPECT_THAT(heard(), ElementsAre());
    swipeLeft();
    test_ui::runFor(0.1);
    pager_->showPage(0, false);
    test_ui::runFor(1.0);
    EXPECT_THAT(heard(), ElementsAre("start", testing::StartsWith("stop ")));
    EXPECT_EQ(0, pager_->inView());
}

TEST_F(PageMovement, APagerOfOnePageOnlyBounces) {
    listenTo(0, 1);
    for (const double seconds : {0.06, 0.15, 1.0}) {
        for (const auto& [from, to] : {std::pair(600, 150), std::pair(150, 600)}) {
            screen().swipe({from, 700}, {to, 700}, seconds);
            EXPECT_NE(0, test_ui::geometry(pages_[0]->getEvasObj()).x) << seconds;
            test_ui::runFor(1.0);
            EXPECT_EQ(0, test_ui::geometry(pages_[0]->getEvasObj()).x);
            EXPECT_THAT(heard(), ElementsAre("start", "stop 0")) << seconds;
        }
    }
    EXPECT_EQ(0, framesInASecond());
}

TEST_F(PageMovement, APagerOfNoPageTakesASwipe) {
    listenTo(0, 0);
    EXPECT_EQ(0, pager_->getPageCount());
    swipeLeft();
    test_ui::runFor(1.0);
    EXPECT_THAT(heard(), ElementsAre());
    EXPECT_EQ(0, framesInASecond());
}

TEST_F(PageMovement, APageTurnedToStaysInViewWhenTheScreenTurnsSmaller) {
    listenTo(3);
    swipeLeft();
    test_ui::runFor(1.0);
    heard();
    evas_object_resize(naviframe_.getEvasObj(), 480, 800);
    test_ui::runFor(0.5);
    EXPECT_EQ(4, pager_->inView());
    EXPECT_EQ(0, test_ui::geometry(pages_[4]->getEvasObj()).x);
    EXPECT_THAT(heard(), ElementsAre());
}

}  // namespace
