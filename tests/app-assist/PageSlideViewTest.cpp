#include "Views.h"

#include "support/TemporaryDevice.h"
#include "ui/UiTest.h"

#include <app-assist/WNaviframe.h>
#include <app-assist/WPageSlideView.h>
#include <gmock/gmock.h>

#include <utility>

using app_assist::WNaviframe;
using app_assist::WPageSlideView;
using app_assist::WView;
using test_ui::Rect;
using testing::ElementsAre;
using testing::IsEmpty;

namespace {

/// A page that is filled with one colour, or with a text, or with a text in a scroller of its own.
class Page : public TellingView {
public:
    using TellingView::TellingView;
    enum class Filling { Nothing, Text, ScrolledText } filling = Filling::Nothing;
    Evas_Object* entry = nullptr;
    Evas_Object* inner = nullptr;
    int clicks = 0;

protected:
    Evas_Object* onCreate(Evas_Object* parent, void* viewParam) override {
        if (filling == Filling::Nothing)
            return TellingView::onCreate(parent, viewParam);
        if (filling == Filling::Text)
            return makeEntry(parent);
        inner = elm_scroller_add(parent);
        elm_object_content_set(inner, makeEntry(inner));
        return inner;
    }

private:
    Evas_Object* makeEntry(Evas_Object* parent) {
        entry = elm_entry_add(parent);
        elm_entry_editable_set(entry, EINA_FALSE);
        elm_entry_context_menu_disabled_set(entry, EINA_TRUE);
        std::string text = "<a href=more>more</a>";
        for (int i = 0; i < (inner ? 2000 : 300); ++i)
            text += " one two three four five six";
        elm_object_text_set(entry, text.c_str());
        evas_object_size_hint_weight_set(entry, EVAS_HINT_EXPAND, EVAS_HINT_EXPAND);
        evas_object_size_hint_align_set(entry, EVAS_HINT_FILL, EVAS_HINT_FILL);
        evas_object_smart_callback_add(
            entry, "anchor,clicked", [](void* page, Evas_Object*, void*) { ++static_cast<Page*>(page)->clicks; }, this);
        evas_object_show(entry);
        return entry;
    }
};

/// A pager whose pages are given to it as the application's is: constructed before, appended when it was pushed.
class Pager : public WPageSlideView {
public:
    Pager(std::vector<WView*> pages, int first) : pages_(std::move(pages)), first_(first) {}

    int inView() const {
        int page = -1;
        elm_scroller_current_page_get(getScroller(), &page, nullptr);
        return page;
    }

protected:
    Evas_Object* onCreate(Evas_Object* parent, void*) override {
        Evas_Object* layout = elm_box_add(parent);
        evas_object_size_hint_weight_set(layout, EVAS_HINT_EXPAND, EVAS_HINT_EXPAND);
        Evas_Object* scroller = WPageSlideView::onCreate(layout, nullptr);
        elm_box_pack_end(layout, scroller);
        evas_object_show(scroller);
        return layout;
    }
    void onPushed(Elm_Object_Item*) override {
        for (WView* page : pages_)
            appendPage(page);
        showPage(first_, true);
    }

private:
    std::vector<WView*> pages_;
    int first_;
};

class PageSlideView : public test_ui::UiTest {
protected:
    PageSlideView() {
        naviframe_.create(window(), nullptr);
        evas_object_resize(naviframe_.getEvasObj(), 720, 1280);
        evas_object_show(naviframe_.getEvasObj());
    }

    Page* make(const std::string& name, Page::Filling filling = Page::Filling::Nothing) {
        auto* page = new Page(name, story_);
        page->filling = filling;
        pages_.push_back(page);
        return page;
    }
    /// Pushes a pager of these pages, opened at `first`, and lets it move in.
    Pager* open(int first, int count = 5) {
        while (static_cast<int>(pages_.size()) < count)
            make(std::to_string(pages_.size()));
        auto* pager = new Pager({pages_.begin(), pages_.end()}, first);
        naviframe_.push(pager, nullptr, nullptr);
        return pager;
    }
    void swipeLeft() { screen().swipe({600, 700}, {150, 700}); }
    void swipeRight() { screen().swipe({150, 700}, {600, 700}); }

    /// Counts an event of the pager's scroller from now on.
    void count(Pager& pager, const char* event, int& counter) {
        evas_object_smart_callback_add(
            pager.getScroller(), event, [](void* data, Evas_Object*, void*) { ++*static_cast<int*>(data); }, &counter);
    }

    Story told() { return std::exchange(story_, {}); }

    support::TemporaryDevice device_;
    Story story_;
    std::vector<Page*> pages_;
    WNaviframe naviframe_;
};

TEST_F(PageSlideView, EachPageIsCreatedAndToldWhatItBecame) {
    Pager* pager = open(0, 2);
    EXPECT_EQ(2, pager->getPageCount());
    EXPECT_THAT(told(), ElementsAre("0: onCreate", "0: onCreated", "0: onSetAsPageContent", "0: onPushed",
                                    "1: onCreate", "1: onCreated", "1: onSetAsPageContent", "1: onPushed"));
}

TEST_F(PageSlideView, PagesAreAsLargeAsTheViewAndStandBesideEachOther) {
    Pager* pager = open(0, 3);
    test_ui::runFor(0.5);
    const Rect view = test_ui::geometry(pager->getScroller());
    EXPECT_EQ(720, view.width);
    for (int i = 0; i < 3; ++i) {
        const Rect expected{view.x + i * view.width, view.y, view.width, view.height};
        EXPECT_EQ(expected, test_ui::geometry(pages_[static_cast<size_t>(i)]->getEvasObj())) << "page " << i;
    }
}

class FirstPage : public PageSlideView, public testing::WithParamInterface<int> {};

TEST_P(FirstPage, IsInViewAtOnceThoughNothingWasLaidOut) {
    Pager* pager = open(GetParam());
    EXPECT_EQ(GetParam(), pager->inView());
    test_ui::runFor(1.0);
    EXPECT_EQ(GetParam(), pager->inView());
    EXPECT_EQ(0, test_ui::geometry(pages_[static_cast<size_t>(GetParam())]->getEvasObj()).x);
}

INSTANTIATE_TEST_SUITE_P(Pages, FirstPage, testing::Range(0, 5));

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

TEST_F(PageSlideView, ASwipeTurnsOnePageHoweverHardItIs) {
    Pager* pager = open(1);
    test_ui::runFor(0.5);
    screen().swipe({700, 700}, {20, 700}, 0.06);
    test_ui::runFor(1.0);
    EXPECT_EQ(2, pager->inView());
    swipeRight();
    test_ui::runFor(1.0);
    EXPECT_EQ(1, pager->inView());
}

TEST_F(PageSlideView, ATurnOfThePageStartsAndStopsOnce) {
    Pager* pager = open(1);
    test_ui::runFor(0.5);
    int starts = 0, stops = 0;
    count(*pager, "scroll,anim,start", starts);
    count(*pager, "scroll,anim,stop", stops);
    swipeLeft();
    test_ui::runFor(2.0);
    EXPECT_EQ(1, starts);
    EXPECT_EQ(1, stops);
    EXPECT_EQ(2, pager->inView());
}

TEST_F(PageSlideView, ABounceAtEitherEndComesToRest) {
    Pager* pager = open(0, 2);
    test_ui::runFor(0.5);
    int starts = 0, stops = 0;
    count(*pager, "scroll,anim,start", starts);
    count(*pager, "scroll,anim,stop", stops);
    for (const int end : {0, 1}) {
        pager->showPage(end, false);
        test_ui::runFor(0.5);
        starts = stops = 0;
        end == 0 ? swipeRight() : swipeLeft();
        test_ui::runFor(0.5);
        EXPECT_EQ(end, pager->inView());
        EXPECT_EQ(0, test_ui::geometry(pages_[static_cast<size_t>(end)]->getEvasObj()).x);
        EXPECT_EQ(1, starts);
        // The end of the bounce, and the end of the animation that EFL would leave going.
        EXPECT_EQ(2, stops);
        test_ui::runFor(3.0);
        EXPECT_EQ(2, stops);
    }
}

TEST_F(PageSlideView, ASecondSwipeTakesOverFromTheFirst) {
    Pager* pager = open(0);
    test_ui::runFor(0.5);
    swipeLeft();
    test_ui::runFor(0.2);
    swipeLeft();
    test_ui::runFor(1.0);
    EXPECT_EQ(2, pager->inView());
}

TEST_F(PageSlideView, AFingerThatHoldsAMovingPageHoldsIt) {
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

TEST_F(PageSlideView, OnePageOnlyBounces) {
    Pager* pager = open(0, 1);
    test_ui::runFor(0.5);
    swipeLeft();
    test_ui::runFor(2.0);
    EXPECT_EQ(0, pager->inView());
    EXPECT_EQ(0, test_ui::geometry(pages_[0]->getEvasObj()).x);
}

TEST_F(PageSlideView, ASwipeThatBeginsOnTextTurnsThePage) {
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

TEST_F(PageSlideView, AVerticalSwipeOverTextKeepsItsMomentumAndEnds) {
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

TEST_F(PageSlideView, ALinkInATextWorksBeforeAndAfterASwipe) {
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
    auto pager = std::make_unique<Pager>(std::vector<WView*>{}, 0);
    EXPECT_EQ(nullptr, pager->getScroller());
    pager->appendPage(nullptr);
    pager->appendPage(make("early"));
    pager->showPage(0, true);
    EXPECT_EQ(0, pager->getPageCount());
    EXPECT_THAT(told(), ElementsAre("early: deleted"));
}

}  // namespace
