#pragma once

#include "PageSlideViewTest.h"

#include <app-assist/WUiTimer.h>
#include <uxt/Theme.h>

/// A page as an application fills it late: pictures that turn by themselves above a text with a link, which scrolls.
class TipPage : public TellingView {
public:
    enum class Pictures { Sequence, Tall };

    TipPage(std::string name, Story& story, Pictures kind = Pictures::Sequence)
        : TellingView(std::move(name), story), kind_(kind) {}

    Evas_Object* entry = nullptr;
    Evas_Object* info = nullptr;      ///< the scroller around the text
    Evas_Object* pictures = nullptr;  ///< the scroller around the pictures
    Evas_Object* button = nullptr;    ///< lies upon the pictures
    std::vector<Evas_Object*> pages;  ///< of `pictures`
    int clicks = 0, presses = 0;

    void fill() {
        if (entry)
            return;
        elm_box_pack_end(getEvasObj(), kind_ == Pictures::Sequence ? makeSequence() : makeTall());
        elm_box_pack_end(getEvasObj(), makeInfo());
    }
    void addPicture() {
        Evas_Object* row = elm_object_content_get(pictures);
        Evas_Object* picture = evas_object_rectangle_add(evas_object_evas_get(row));
        expand(picture);
        pages.push_back(sized(row, picture, width, height));
        expand(pages.back());
        elm_box_pack_end(row, pages.back());
    }
    void setText() {
        std::string text = "<font_size=36 align=left>" + text_;
        for (int i = 0; i < 300; ++i)
            text += " one two three four five six";
        elm_object_text_set(entry, (text + " <a href=more>more</a></>").c_str());
    }
    void setText(const std::string& text) {
        text_ = text;
        setText();
    }
    int pictureInView() const {
        int page = -1;
        elm_scroller_current_page_get(pictures, &page, nullptr);
        return page;
    }

protected:
    Evas_Object* onCreate(Evas_Object* parent, void*) override {
        Evas_Object* page = elm_box_add(parent);
        evas_object_size_hint_weight_set(page, EVAS_HINT_EXPAND, EVAS_HINT_EXPAND);
        return page;
    }

private:
    static constexpr int width = 716, height = 655;

    static void expand(Evas_Object* object) {
        evas_object_size_hint_weight_set(object, EVAS_HINT_EXPAND, EVAS_HINT_EXPAND);
        evas_object_size_hint_align_set(object, EVAS_HINT_FILL, EVAS_HINT_FILL);
        evas_object_show(object);
    }
    /// Has `content` that size at least, which the widget itself would not keep.
    static Evas_Object* sized(Evas_Object* parent, Evas_Object* content, int minWidth, int minHeight) {
        Evas_Object* table = elm_table_add(parent);
        Evas_Object* sizer = evas_object_rectangle_add(evas_object_evas_get(parent));
        evas_object_size_hint_min_set(sizer, minWidth, minHeight);
        elm_table_pack(table, sizer, 0, 0, 1, 1);
        elm_table_pack(table, content, 0, 0, 1, 1);
        evas_object_show(table);
        return table;
    }

    Evas_Object* makeSequence() {
        pictures = elm_scroller_add(getEvasObj());
        elm_scroller_loop_set(pictures, EINA_FALSE, EINA_FALSE);
        elm_scroller_policy_set(pictures, ELM_SCROLLER_POLICY_OFF, ELM_SCROLLER_POLICY_OFF);
        elm_scroller_page_scroll_limit_set(pictures, 1, 0);
        elm_object_scroll_lock_y_set(pictures, EINA_TRUE);
        elm_scroller_single_direction_set(pictures, ELM_SCROLLER_SINGLE_DIRECTION_HARD);
        elm_scroller_movement_block_set(pictures, ELM_SCROLLER_MOVEMENT_BLOCK_HORIZONTAL);
        expand(pictures);
        Evas_Object* row = elm_box_add(pictures);
        elm_box_horizontal_set(row, EINA_TRUE);
        elm_object_content_set(pictures, row);
        elm_scroller_page_relative_set(pictures, 1.0, 0.0);
        for (int i = 0; i < 5; ++i)
            addPicture();
        elm_scroller_page_bring_in(pictures, 0, 0);
        Evas_Object* area = sized(getEvasObj(), pictures, width, height);
        button = elm_button_add(area);
        evas_object_smart_callback_add(
            button, "clicked", [](void* self, Evas_Object*, void*) { ++static_cast<TipPage*>(self)->presses; }, this);
        evas_object_show(button);
        elm_table_pack(area, button, 0, 0, 1, 1);
        return area;
    }

    Evas_Object* makeTall() {
        pictures = elm_scroller_add(getEvasObj());
        elm_scroller_bounce_set(pictures, EINA_FALSE, EINA_TRUE);
        elm_scroller_movement_block_set(pictures, ELM_SCROLLER_MOVEMENT_BLOCK_VERTICAL);
        elm_scroller_policy_set(pictures, ELM_SCROLLER_POLICY_OFF, ELM_SCROLLER_POLICY_OFF);
        expand(pictures);
        Evas_Object* picture = evas_object_rectangle_add(evas_object_evas_get(pictures));
        expand(picture);
        elm_object_content_set(pictures, sized(pictures, picture, width, 3 * height));
        return sized(getEvasObj(), pictures, width, height);
    }

    Evas_Object* makeInfo() {
        info = elm_scroller_add(getEvasObj());
        elm_scroller_bounce_set(info, EINA_FALSE, EINA_TRUE);
        elm_scroller_policy_set(info, ELM_SCROLLER_POLICY_OFF, ELM_SCROLLER_POLICY_AUTO);
        elm_object_style_set(info, "effect");
        Evas_Object* layout = elm_layout_add(info);
        expand(layout);
        elm_object_content_set(info, layout);
        elm_layout_theme_set(layout, "layout", "application", "default");
        entry = elm_entry_add(layout);
        expand(entry);
        elm_object_part_content_set(layout, "elm.swallow.content", entry);
        evas_object_smart_callback_add(
            entry, "anchor,clicked", [](void* self, Evas_Object*, void*) { ++static_cast<TipPage*>(self)->clicks; },
            this);
        setText();
        expand(info);
        elm_entry_editable_set(entry, EINA_FALSE);
        elm_entry_scrollable_set(entry, EINA_FALSE);
        return info;
    }

    Pictures kind_;
    std::string text_ = "A tip.";
};

/// A pager that fills the page that it opens at first, and the others when it has moved in.
class TipPager : public Pager {
public:
    TipPager(std::vector<TipPage*> pages, int first)
        : Pager({pages.begin(), pages.end()}, first), tips_(std::move(pages)), first_(first) {}

protected:
    void onPushed(Elm_Object_Item* item) override {
        Pager::onPushed(item);
        const auto fillFirst = [this](app_assist::WView*) {
            tips_[static_cast<size_t>(first_)]->fill();
            return false;
        };
        const auto fillAll = [this](app_assist::WView*) {
            for (TipPage* tip : tips_)
                tip->fill();
            return false;
        };
        app_assist::WUiTimer::addIdler(fillFirst, this, getEvasObj());
        app_assist::WUiTimer::addTimer(0.4, fillAll, this, getEvasObj());
    }

private:
    std::vector<TipPage*> tips_;
    int first_;
};

/// What an application hears of its pager's movements: "start", and "stop <page in view>".
class Movements {
public:
    /// What the application does then, the next time.
    std::function<void()> atStart, atStop;

    void listenTo(Pager& pager) {
        pager_ = &pager;
        evas_object_smart_callback_add(
            pager.getScroller(), "scroll,anim,stop",
            [](void* self, Evas_Object*, void*) { static_cast<Movements*>(self)->stopped(); }, this);
        evas_object_smart_callback_add(
            pager.getScroller(), "scroll,anim,start",
            [](void* self, Evas_Object*, void*) { static_cast<Movements*>(self)->started(); }, this);
    }
    Story heard() { return std::exchange(heard_, {}); }

private:
    void started() {
        heard_.emplace_back("start");
        if (const auto act = std::exchange(atStart, nullptr))
            act();
    }
    void stopped() {
        heard_.push_back("stop " + std::to_string(pager_->inView()));
        if (const auto act = std::exchange(atStop, nullptr))
            act();
    }

    Pager* pager_ = nullptr;
    Story heard_;
};

/// A test with a pager of tips.
class TipPagerTest : public PageSlideViewTest {
protected:
    TipPagerTest() {
        std::filesystem::copy_file(TEST_DEVICE_THEME, device_.data() / "device.edj");
        uxt::applyDeviceTheme(false);
    }

    /// Opens a pager at `first`; everything is filled a second later.
    TipPager* openTips(int first, int count = 5, TipPage::Pictures pictures = TipPage::Pictures::Sequence) {
        for (int i = 0; i < count; ++i)
            tips_.push_back(new TipPage(std::to_string(i), story_, pictures));
        auto* pager = new TipPager(tips_, first);
        naviframe_.push(pager, nullptr, nullptr);
        movements_.listenTo(*pager);
        return pager;
    }
    TipPage& tip(int index) { return *tips_[static_cast<size_t>(index)]; }
    Story heard() { return movements_.heard(); }

    std::vector<TipPage*> tips_;
    Movements movements_;
};
