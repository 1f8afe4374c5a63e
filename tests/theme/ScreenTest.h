#pragma once

#include "uxt/Theme.h"

#include "support/TemporaryDevice.h"
#include "ui/UiTest.h"

#include <gmock/gmock.h>

#include <cstdlib>
#include <string>
#include <utility>
#include <vector>

/// Whether two colours look the same: drawing rounds, by one or two steps of a part.
inline bool isNear(unsigned int a, unsigned int b) {
    const auto difference = [&](int shift) {
        return std::abs(static_cast<int>(a >> shift & 255) - static_cast<int>(b >> shift & 255));
    };
    return difference(16) <= 2 && difference(8) <= 2 && difference(0) <= 2;
}

MATCHER_P(LooksLike, colour, "") {
    return isNear(arg, colour);
}

/// A screen of the device as an application fills it: a naviframe with a list in the device's styles.
class ScreenTest : public test_ui::UiTest {
protected:
    ScreenTest() { std::filesystem::copy_file(DEVICE_THEME, device_.data() / "device.edj"); }

    struct Row {
        std::string caption;
        std::string title;
    };

    /// Brings the device up with a display of that kind and a naviframe on it.
    void start(bool isLarge = true, bool isDark = false) {
        elm_config_scale_set(isLarge ? 2.6 : 1.7);
        elm_app_base_scale_set(2.6);
        uxt::applyDeviceTheme(isDark);
        Evas_Object* screen = isLarge ? window(720, 1280) : window(480, 800);
        naviframe_ = elm_naviframe_add(screen);
        evas_object_size_hint_weight_set(naviframe_, EVAS_HINT_EXPAND, EVAS_HINT_EXPAND);
        elm_win_resize_object_add(screen, naviframe_);
        evas_object_show(naviframe_);
    }

    void TearDown() override {
        elm_config_mirrored_set(EINA_FALSE);
        UiTest::TearDown();
    }

    /// Pushes a list with a section's title and these rows.
    Evas_Object* pushList(std::vector<Row> rows) {
        rows_ = std::move(rows);
        Evas_Object* list = elm_genlist_add(naviframe_);
        elm_genlist_mode_set(list, ELM_LIST_COMPRESS);
        elm_genlist_homogeneous_set(list, EINA_TRUE);
        section_.item_style = "groupindex";
        section_.func.text_get = [](void*, Evas_Object*, const char* part) -> char* {
            return std::string("elm.text.main") == part ? strdup("Tips and guidelines") : nullptr;
        };
        row_.item_style = "2line.bottom";
        row_.func.text_get = [](void* data, Evas_Object*, const char* part) {
            const auto* row = static_cast<const Row*>(data);
            return strdup(std::string("elm.text.sub.left.top") == part ? row->caption.c_str() : row->title.c_str());
        };
        row_.func.content_get = [](void*, Evas_Object* owner, const char*) {
            Evas_Object* frame = elm_layout_add(owner);
            EXPECT_TRUE(elm_layout_theme_set(frame, "layout", "list/B/type.2", "default"));
            Evas_Object* icon = evas_object_rectangle_add(evas_object_evas_get(owner));
            evas_object_color_set(icon, 200, 0, 0, 255);
            elm_object_part_content_set(frame, "elm.swallow.content", icon);
            return frame;
        };
        Elm_Object_Item* title =
            elm_genlist_item_append(list, &section_, nullptr, nullptr, ELM_GENLIST_ITEM_NONE, nullptr, nullptr);
        elm_genlist_item_select_mode_set(title, ELM_OBJECT_SELECT_MODE_DISPLAY_ONLY);
        for (Row& row : rows_)
            elm_genlist_item_append(list, &row_, &row, nullptr, ELM_GENLIST_ITEM_NONE, nullptr, nullptr);
        Elm_Object_Item* item = elm_naviframe_item_push(naviframe_, nullptr, nullptr, nullptr, list, nullptr);
        elm_object_item_part_text_set(item, "elm.text.title", "Tips");
        test_ui::runFor(0.5);
        return list;
    }

    /// Pushes an empty page with the device's back button, which counts its clicks.
    Elm_Object_Item* pushPage() {
        Evas_Object* back = elm_button_add(naviframe_);
        EXPECT_TRUE(elm_object_style_set(back, "naviframe/back_btn/default"));
        evas_object_smart_callback_add(
            back, "clicked", [](void* clicks, Evas_Object*, void*) { ++*static_cast<int*>(clicks); }, &clicks_);
        evas_object_show(back);
        Evas_Object* page = elm_layout_add(naviframe_);
        EXPECT_TRUE(elm_layout_theme_set(page, "layout", "application", "default"));
        Elm_Object_Item* item = elm_naviframe_item_push(naviframe_, nullptr, back, nullptr, page, nullptr);
        elm_object_item_part_text_set(item, "elm.text.title", "1/9");
        return item;
    }

    std::vector<test_ui::Rect> rowGeometries(const Evas_Object* list) {
        std::vector<test_ui::Rect> all;
        for (Elm_Object_Item* row : test_ui::rows(list))
            all.push_back(test_ui::rowGeometry(row));
        return all;
    }

    static std::vector<Row> threeRows() {
        return {{"Phone", "Answer calls"}, {"Health", "Measure your heart rate"}, {"Music", "Control music"}};
    }

    support::TemporaryDevice device_;
    Evas_Object* naviframe_ = nullptr;
    int clicks_ = 0;

private:
    Elm_Genlist_Item_Class section_ = {};
    Elm_Genlist_Item_Class row_ = {};
    std::vector<Row> rows_;
};
