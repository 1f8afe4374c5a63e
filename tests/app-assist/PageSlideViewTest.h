#pragma once

#include "Views.h"
#include "support/TemporaryDevice.h"
#include "ui/UiTest.h"

#include <app-assist/WNaviframe.h>
#include <app-assist/WPageSlideView.h>

#include <string>
#include <utility>
#include <vector>

/// A page that is a button, or empty, or filled with a text, or with a text in a scroller of its own.
class Page : public TellingView {
public:
    using TellingView::TellingView;
    enum class Filling { Button, Nothing, Text, ScrolledText } filling = Filling::Button;
    Evas_Object* entry = nullptr;
    Evas_Object* inner = nullptr;
    int clicks = 0;

protected:
    Evas_Object* onCreate(Evas_Object* parent, void* viewParam) override {
        if (filling == Filling::Button)
            return TellingView::onCreate(parent, viewParam);
        if (filling == Filling::Nothing)
            return elm_layout_add(parent);
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
class Pager : public app_assist::WPageSlideView {
public:
    Pager(std::vector<app_assist::WView*> pages, int first) : pages_(std::move(pages)), first_(first) {}

    bool onTop = true;  ///< pushed with a transition; else inserted without one
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
    Elm_Object_Item* onPushToNaviframe(Evas_Object* naviframe) override {
        Evas_Object* back = elm_button_add(naviframe);
        if (onTop)
            return elm_naviframe_item_push(naviframe, nullptr, back, nullptr, getEvasObj(), nullptr);
        return elm_naviframe_item_insert_after(naviframe, elm_naviframe_top_item_get(naviframe), nullptr, back, nullptr,
                                               getEvasObj(), nullptr);
    }
    void onPushed(Elm_Object_Item*) override {
        for (app_assist::WView* page : pages_)
            appendPage(page);
        showPage(first_, true);
    }

private:
    std::vector<app_assist::WView*> pages_;
    int first_;
};

/// A test with a pager on a naviframe in a window.
class PageSlideViewTest : public test_ui::UiTest {
protected:
    PageSlideViewTest() {
        naviframe_.create(window(), nullptr);
        evas_object_resize(naviframe_.getEvasObj(), 720, 1280);
        evas_object_show(naviframe_.getEvasObj());
    }

    Page* make(const std::string& name, Page::Filling filling = Page::Filling::Button) {
        auto* page = new Page(name, story_);
        page->filling = filling;
        pages_.push_back(page);
        return page;
    }
    /// Pushes a pager of these pages, opened at `first`, and lets it move in.
    Pager* open(int first, int count = 5, bool onTop = true) {
        while (static_cast<int>(pages_.size()) < count)
            make(std::to_string(pages_.size()));
        auto* pager = new Pager({pages_.begin(), pages_.end()}, first);
        pager->onTop = onTop;
        naviframe_.push(pager, nullptr, nullptr);
        return pager;
    }
    void swipeLeft() { screen().swipe({600, 700}, {150, 700}); }
    void swipeRight() { screen().swipe({150, 700}, {600, 700}); }

    Story told() { return std::exchange(story_, {}); }

    support::TemporaryDevice device_;
    Story story_;
    std::vector<Page*> pages_;
    app_assist::WNaviframe naviframe_;
};
