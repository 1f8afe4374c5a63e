#include "PageSlideViewTest.h"

#include <gmock/gmock.h>

namespace {

class PageSwipe : public PageSlideViewTest {};

TEST_F(PageSwipe, ASwipeTurnsOnePageHoweverHardItIs) {
    Pager* pager = open(1);
    test_ui::runFor(0.5);
    screen().swipe({700, 700}, {20, 700}, 0.06);
    test_ui::runFor(1.0);
    EXPECT_EQ(2, pager->inView());
    swipeRight();
    test_ui::runFor(1.0);
    EXPECT_EQ(1, pager->inView());
}

TEST_F(PageSwipe, ASecondSwipeTakesOverFromTheFirst) {
    Pager* pager = open(0);
    test_ui::runFor(0.5);
    swipeLeft();
    test_ui::runFor(0.2);
    swipeLeft();
    test_ui::runFor(1.0);
    EXPECT_EQ(2, pager->inView());
}

TEST_F(PageSwipe, AFingerThatHoldsAMovingPageHoldsIt) {
    Pager* pager = open(0);
    test_ui::runFor(0.5);
    swipeLeft();
    test_ui::runFor(0.1);
    screen().press({400, 700});
    test_ui::runFor(0.3);
    screen().lift();
    test_ui::runFor(1.0);
    const int settled = test_ui::geometry(pages_[static_cast<size_t>(pager->inView())]->getEvasObj()).x;
    EXPECT_EQ(0, settled);
}

TEST_F(PageSwipe, ASwipeThatBeginsOnTextTurnsThePage) {
    for (const char* name : {"a", "b", "c"})
        make(name, Page::Filling::Text);
    Pager* pager = open(0, 3);
    test_ui::runFor(0.5);
    swipeLeft();
    test_ui::runFor(1.0);
    EXPECT_EQ(1, pager->inView());
    swipeLeft();
    test_ui::runFor(1.0);
    EXPECT_EQ(2, pager->inView());
}

TEST_F(PageSwipe, AVerticalSwipeOverTextKeepsItsMomentumAndEnds) {
    Page* page = make("a", Page::Filling::ScrolledText);
    open(0, 2);
    test_ui::runFor(0.5);
    int stops = 0, y = 0, later = 0;
    evas_object_smart_callback_add(
        page->inner, "scroll,anim,stop", [](void* data, Evas_Object*, void*) { ++*static_cast<int*>(data); }, &stops);
    screen().swipe({300, 900}, {300, 500});
    elm_scroller_region_get(page->inner, nullptr, &y, nullptr, nullptr);
    test_ui::runFor(3.0);
    elm_scroller_region_get(page->inner, nullptr, &later, nullptr, nullptr);
    EXPECT_GT(later, y + 100);
    EXPECT_EQ(1, stops);
}

TEST_F(PageSwipe, ALinkInATextWorksBeforeAndAfterASwipe) {
    Page* first = make("a", Page::Filling::Text);
    Page* second = make("b", Page::Filling::Text);
    open(0, 2);
    test_ui::runFor(0.5);
    screen().tap(test_ui::link(first->entry, "more").middle());
    test_ui::runFor(0.1);
    EXPECT_EQ(1, first->clicks);
    swipeLeft();
    test_ui::runFor(1.0);
    screen().tap(test_ui::link(second->entry, "more").middle());
    test_ui::runFor(0.1);
    EXPECT_EQ(1, second->clicks);
    EXPECT_EQ(1, first->clicks);
}

}  // namespace
