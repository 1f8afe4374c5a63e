#include "PageSlideViewTest.h"

#include <gmock/gmock.h>

using test_ui::Rect;
using testing::ElementsAre;

namespace {

class PageSlideView : public PageSlideViewTest {};

TEST_F(PageSlideView, EachPageIsCreatedAndToldWhatItBecame) {
    Pager* pager = open(0, 2);
    EXPECT_EQ(2, pager->getPageCount());
    EXPECT_THAT(told(), ElementsAre("0: onCreate", "0: onCreated", "0: onSetAsPageContent", "0: onPushed",
                                    "1: onCreate", "1: onCreated", "1: onSetAsPageContent", "1: onPushed"));
}

TEST_F(PageSlideView, PagesAreAsLargeAsTheViewAndThoseOutOfSightStandBesideIt) {
    Pager* pager = open(2, 5);
    test_ui::runFor(0.5);
    const Rect view = test_ui::geometry(pager->getScroller());
    EXPECT_EQ(720, view.width);
    for (int i = 0; i < 5; ++i) {
        const int x = i < 2 ? -720 : i > 2 ? 720 : 0;
        const Rect expected{view.x + x, view.y, view.width, view.height};
        EXPECT_EQ(expected, test_ui::geometry(pages_[static_cast<size_t>(i)]->getEvasObj())) << "page " << i;
    }
}

TEST_F(PageSlideView, APageThatComesIntoSightTouchesTheOneThatGoes) {
    open(1, 5);
    test_ui::runFor(0.5);
    screen().press({600, 700});
    for (int x = 600; x > 100; x -= 20) {
        test_ui::runFor(0.02);
        screen().moveTo({x, 700});
    }
    const Rect goes = test_ui::geometry(pages_[1]->getEvasObj());
    EXPECT_LT(goes.x, -300);
    EXPECT_EQ(goes.x + goes.width, test_ui::geometry(pages_[2]->getEvasObj()).x);
    screen().lift();
}

class FirstPage : public PageSlideView, public testing::WithParamInterface<std::tuple<int, bool>> {
protected:
    /// Opens a pager of fifteen pages above a list.
    Pager* openAbove() {
        naviframe_.push(new TellingView("list", story_), nullptr, nullptr);
        test_ui::runFor(0.5);
        return open(first(), 15, std::get<1>(GetParam()));
    }
    static int first() { return std::get<0>(GetParam()); }
    void expectInView(const Pager& pager) const {
        EXPECT_EQ(first(), pager.inView());
        const Rect view = test_ui::geometry(pager.getScroller());
        const Rect page = test_ui::geometry(pages_[static_cast<size_t>(first())]->getEvasObj());
        EXPECT_EQ(view, page);
    }
};

TEST_P(FirstPage, IsInViewAtOnceThoughNothingWasLaidOut) {
    Pager* pager = openAbove();
    EXPECT_EQ(first(), pager->inView());
    test_ui::runFor(0.02);
    EXPECT_EQ(first(), pager->inView());
    test_ui::runFor(1.0);
    expectInView(*pager);
}

TEST_P(FirstPage, StaysInViewWhenTheScreenTurnsSmallerOrLarger) {
    Pager* pager = openAbove();
    for (const auto& [width, height] : {std::pair(480, 800), std::pair(720, 1280), std::pair(1280, 720)}) {
        evas_object_resize(naviframe_.getEvasObj(), width, height);
        test_ui::runFor(0.5);
        EXPECT_EQ(width, test_ui::geometry(pager->getScroller()).width);
        expectInView(*pager);
    }
}

INSTANTIATE_TEST_SUITE_P(Pages, FirstPage, testing::Combine(testing::Values(0, 7, 14), testing::Bool()));

TEST_F(PageSlideView, ShowsAPageAtOnceAndOnlyOneThatExists) {
    Pager* pager = open(0);
    test_ui::runFor(0.5);
    pager->showPage(3, false);
    EXPECT_EQ(3, pager->inView());
    pager->showPage(-1, false);
    pager->showPage(5, true);
    test_ui::runFor(0.5);
    EXPECT_EQ(3, pager->inView());
}

TEST_F(PageSlideView, ShowsThePageThatWasAskedForBeforeThereWasRoom) {
    evas_object_resize(naviframe_.getEvasObj(), 0, 0);
    Pager* pager = open(2);
    test_ui::runFor(0.5);
    evas_object_resize(naviframe_.getEvasObj(), 720, 1280);
    test_ui::runFor(0.5);
    EXPECT_EQ(2, pager->inView());
    EXPECT_EQ(720, test_ui::geometry(pages_[2]->getEvasObj()).width);
}

TEST_F(PageSlideView, APageHasTheNaviframeAndTheItemOfItsPager) {
    Pager* pager = open(0, 1);
    EXPECT_EQ(pager->getNaviItem(), pages_[0]->getNaviItem());
    EXPECT_NE(nullptr, pages_[0]->getNaviItem());
    EXPECT_EQ(&naviframe_, pages_[0]->getNaviframe());
}

TEST_F(PageSlideView, PagesGoWithTheirPager) {
    naviframe_.push(new TellingView("list", story_), nullptr, nullptr);
    test_ui::runFor(0.5);
    open(0, 2);
    test_ui::runFor(0.5);
    told();
    test_ui::inMainLoop([this] { elm_naviframe_item_pop(naviframe_.getEvasObj()); });
    test_ui::runFor(0.5);
    EXPECT_THAT(told(), ElementsAre("list: onBecomeTop", "1: onDestroy", "1: deleted", "0: onDestroy", "0: deleted"));
}

TEST_F(PageSlideView, PagesGoWithTheWindowAlsoInTheMiddleOfASwipe) {
    open(0, 2);
    test_ui::runFor(0.5);
    swipeRight();
    told();
    evas_object_del(window());
    EXPECT_THAT(told(), ElementsAre("1: onDestroy", "1: deleted", "0: onDestroy", "0: deleted"));
    test_ui::runFor(1.0);
}

TEST_F(PageSlideView, APageThatGoesByItselfIsNoPageAnyMore) {
    Pager* pager = open(0, 3);
    test_ui::runFor(0.5);
    told();
    evas_object_del(pages_[1]->getEvasObj());
    EXPECT_THAT(told(), ElementsAre("1: onDestroy", "1: deleted"));
    EXPECT_EQ(2, pager->getPageCount());
    test_ui::runFor(0.5);
    EXPECT_EQ(720, test_ui::geometry(pages_[2]->getEvasObj()).x);
}

TEST_F(PageSlideView, APageThatCannotBeMadeIsFreedAndSaidInTheLog) {
    make("broken")->canBeCreated = false;
    Pager* pager = open(0, 2);
    EXPECT_EQ(1, pager->getPageCount());
    EXPECT_THAT(told(), ElementsAre("broken: onCreate", "broken: deleted", "1: onCreate", "1: onCreated",
                                    "1: onSetAsPageContent", "1: onPushed"));
    EXPECT_THAT(device_.logMessages(), ElementsAre("E APP_ASSIST the page broken could not be made"));
}

TEST_F(PageSlideView, NoPageAndNoPlaceForOneAreHarmless) {
    auto pager = std::make_unique<Pager>(std::vector<app_assist::WView*>{}, 0);
    EXPECT_EQ(nullptr, pager->getScroller());
    pager->appendPage(nullptr);
    pager->appendPage(make("early"));
    pager->showPage(0, true);
    EXPECT_EQ(0, pager->getPageCount());
    EXPECT_THAT(told(), ElementsAre("early: deleted"));
}

}  // namespace
