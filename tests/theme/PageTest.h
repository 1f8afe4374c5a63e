#pragma once

#include "ScreenTest.h"

#include "ui_extension.h"

#include <string>
#include <vector>

/// A page as the application fills it: the picture area above, the title and the text below, on a naviframe.
class PageTest : public ScreenTest {
protected:
    struct Kind {
        bool isLarge = true;
        bool isDark = false;
    };

    void TearDown() override {
        uxt_theme_delete_color_table(colours_);
        ScreenTest::TearDown();
    }

    void startPage() { startPage(Kind()); }
    /// Pushes a page that has nothing but its layout.
    void startPage(Kind kind) {
        start(kind.isLarge, kind.isDark);
        width_ = kind.isLarge ? 716 : 478;
        height_ = kind.isLarge ? 655 : 369;
        colours_ = uxt_theme_add_color_table(PROJECT "/res/table/com.ravella.kest_ChangeableColorInfo.xml");
        uxt_theme_set_changeable_ui_enabled(EINA_TRUE);
        uxt_theme_set_style(UXT_THEME_STYLE_DEVICE);
        uxt_theme_set_color_table(colours_);
        layout_ = add(naviframe_, "kest/content/main");
        Elm_Object_Item* item = elm_naviframe_item_push(naviframe_, nullptr, nullptr, nullptr, layout_, nullptr);
        elm_object_item_part_text_set(item, "elm.text.title", "1/9");
    }

    /// A picture file of one colour (0xRRGGBB).
    std::string picture(unsigned int colour, int width = 716, int height = 655) {
        const auto file = device_.folder() / ("picture-" + std::to_string(++files_) + ".png");
        const std::vector<unsigned int> pixels(static_cast<std::size_t>(width * height), 0xFF000000 | colour);
        EXPECT_TRUE(test_ui::Picture(width, height, pixels.data()).save(file));
        return file;
    }

    /// A layout of the application's theme.
    static Evas_Object* add(Evas_Object* parent, const char* group) {
        Evas_Object* layout = elm_layout_add(parent);
        EXPECT_TRUE(elm_layout_file_set(layout, KEST_THEME, group)) << group;
        evas_object_size_hint_weight_set(layout, EVAS_HINT_EXPAND, EVAS_HINT_EXPAND);
        evas_object_show(layout);
        return layout;
    }

    static Evas_Object* image(Evas_Object* parent, const std::string& file) {
        Evas_Object* image = elm_image_add(parent);
        // Else a thread reads it, in a time that is not the test's.
        elm_image_preload_disabled_set(image, EINA_TRUE);
        EXPECT_TRUE(elm_image_file_set(image, file.c_str(), nullptr)) << file;
        evas_object_size_hint_align_set(image, EVAS_HINT_FILL, EVAS_HINT_FILL);
        evas_object_size_hint_weight_set(image, EVAS_HINT_EXPAND, EVAS_HINT_EXPAND);
        evas_object_show(image);
        return image;
    }

    /// One picture of a page with, where `touch` is not empty, the finger's marker.
    Evas_Object* picturePage(Evas_Object* parent, const std::string& file, const std::string& touch, int width,
                             int height) {
        Evas_Object* page = add(parent, width_ > 600 ? "layout/multi_image/page" : "layout/multi_image/hpage");
        elm_object_part_content_set(page, "page", image(page, file));
        if (!touch.empty())
            elm_object_part_content_set(page, "page.touch", image(page, touch));
        Evas_Object* sizer = evas_object_rectangle_add(evas_object_evas_get(page));
        evas_object_size_hint_weight_set(sizer, EVAS_HINT_EXPAND, EVAS_HINT_EXPAND);
        evas_object_size_hint_min_set(sizer, width, height);
        evas_object_show(sizer);
        elm_object_part_content_set(page, "sizer", sizer);
        return page;
    }

    void showPicture(const std::string& file) {
        elm_object_part_content_set(layout_, "video", picturePage(layout_, file, "", width_, height_));
    }

    /// Pictures that a pager shows one after the other, with the markers' pictures where there are.
    void showSequence(const std::vector<std::string>& files, const std::vector<std::string>& touches = {}) {
        pictures_ = add(layout_, "layout/multi_image");
        scroller_ = elm_scroller_add(pictures_);
        elm_scroller_policy_set(scroller_, ELM_SCROLLER_POLICY_OFF, ELM_SCROLLER_POLICY_OFF);
        elm_scroller_page_scroll_limit_set(scroller_, 1, 0);
        elm_scroller_movement_block_set(scroller_, ELM_SCROLLER_MOVEMENT_BLOCK_HORIZONTAL);
        elm_object_part_content_set(pictures_, "scroller", scroller_);
        Evas_Object* box = elm_box_add(scroller_);
        elm_box_horizontal_set(box, EINA_TRUE);
        elm_object_content_set(scroller_, box);
        elm_scroller_page_relative_set(scroller_, 1.0, 0.0);
        elm_object_part_content_set(layout_, "video", pictures_);
        for (std::size_t i = 0; i < files.size(); ++i) {
            pages_.push_back(picturePage(box, files[i], i < touches.size() ? touches[i] : "", width_, height_));
            elm_box_pack_end(box, pages_.back());
        }
    }

    /// A picture that is higher than the area, which scrolls.
    void showTall(const std::string& file, int fileHeight) {
        pictures_ = add(layout_, "layout/multi_image");
        elm_object_part_content_set(layout_, "video", pictures_);
        scroller_ = elm_scroller_add(pictures_);
        elm_scroller_policy_set(scroller_, ELM_SCROLLER_POLICY_OFF, ELM_SCROLLER_POLICY_OFF);
        elm_object_style_set(scroller_, "effect");
        elm_scroller_movement_block_set(scroller_, ELM_SCROLLER_MOVEMENT_BLOCK_VERTICAL);
        elm_object_part_content_set(pictures_, "scroller", scroller_);
        const int height = fileHeight * width_ / 716;
        const bool isSmall = width_ < 600;
        elm_object_content_set(
            scroller_, picturePage(scroller_, file, "", isSmall ? -1 : width_, isSmall ? height - 138 : height));
    }

    /// The title's icon, the title and the text.
    void showInfo(const std::string& icon, const std::string& title, const std::string& text) {
        infoScroller_ = elm_scroller_add(layout_);
        elm_scroller_bounce_set(infoScroller_, EINA_FALSE, EINA_TRUE);
        elm_scroller_policy_set(infoScroller_, ELM_SCROLLER_POLICY_OFF, ELM_SCROLLER_POLICY_AUTO);
        elm_object_style_set(infoScroller_, "effect");
        info_ = add(infoScroller_, "kest/content/scroller");
        evas_object_size_hint_align_set(info_, EVAS_HINT_FILL, EVAS_HINT_FILL);
        elm_object_content_set(infoScroller_, info_);
        entry_ = elm_entry_add(info_);
        elm_object_part_content_set(info_, "entry", entry_);
        evas_object_size_hint_weight_set(entry_, EVAS_HINT_EXPAND, EVAS_HINT_EXPAND);
        evas_object_size_hint_align_set(entry_, EVAS_HINT_FILL, EVAS_HINT_FILL);
        evas_object_smart_callback_add(
            entry_, "anchor,clicked", [](void* links, Evas_Object*, void*) { ++*static_cast<int*>(links); }, &links_);
        elm_object_text_set(entry_,
                            ("<font_style='Regular' font_size=36 align=left linegap=10>" + text + "</>").c_str());
        label_ = elm_label_add(info_);
        elm_label_line_wrap_set(label_, ELM_WRAP_MIXED);
        elm_object_text_set(label_, ("<align=center><item size=62x62 vsize=full href=file:/" + icon +
                                     "></item>  <color=#000000><font_weight='Regular'><font_width='condensed'>"
                                     "<font_size=46>" +
                                     title + "</font_size></font_width></font_weight></color></align>")
                                        .c_str());
        elm_object_part_content_set(info_, "title.area", label_);
        elm_object_part_content_set(layout_, "info", infoScroller_);
        elm_entry_editable_set(entry_, EINA_FALSE);
        elm_entry_scrollable_set(entry_, EINA_FALSE);
        evas_object_show(infoScroller_);
        evas_object_show(entry_);
    }

    Evas_Object* layout_ = nullptr;
    Evas_Object* pictures_ = nullptr;  ///< the layout that has the reply button
    Evas_Object* scroller_ = nullptr;  ///< of the pictures
    std::vector<Evas_Object*> pages_;
    Evas_Object* infoScroller_ = nullptr;
    Evas_Object* info_ = nullptr;
    Evas_Object* entry_ = nullptr;
    Evas_Object* label_ = nullptr;
    int links_ = 0;
    int width_ = 0;
    int height_ = 0;

private:
    int files_ = 0;
    uxt_color_table_h colours_ = {};
};
