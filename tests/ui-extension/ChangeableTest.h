#pragma once

#include "ui_extension.h"
#include "uxt/Theme.h"

#include "support/TemporaryDevice.h"
#include "ui/UiTest.h"

#include <string>

/// A window with layouts of the test's theme, on a device with a theme of two colours.
class ChangeableTest : public test_ui::UiTest {
protected:
    ChangeableTest() { std::filesystem::copy_file(THEMES "/device.edj", device_.data() / "device.edj"); }

    void SetUp() override { uxt::applyDeviceTheme(false); }

    void TearDown() override {
        uxt_theme_set_changeable_ui_enabled(EINA_FALSE);
        uxt_theme_set_style(UXT_THEME_STYLE_DEVICE);
        uxt_theme_set_color_table(nullptr);
        uxt_theme_set_font_table(nullptr);
        UiTest::TearDown();
    }

    /// A shown layout of a group of card.edc, 100 pixels square, with its left upper corner there.
    Evas_Object* layout(const char* group, test_ui::Point at = {0, 0}, Evas_Object* parent = nullptr) {
        Evas_Object* layout = elm_layout_add(parent ? parent : window());
        EXPECT_TRUE(elm_layout_file_set(layout, THEMES "/card.edj", group));
        evas_object_geometry_set(layout, at.x, at.y, 100, 100);
        evas_object_show(layout);
        return layout;
    }

    uxt_color_table_h colourTable(const std::string& entries) {
        const auto path = device_.folder() / ("colours" + std::to_string(++tables_) + ".xml");
        support::writeFile(path, "<color_table>" + entries + "</color_table>");
        return uxt_theme_add_color_table(path.c_str());
    }

    uxt_font_table_h fontTable(const std::string& entries) {
        const auto path = device_.folder() / ("fonts" + std::to_string(++tables_) + ".xml");
        support::writeFile(path, "<font_table>" + entries + "</font_table>");
        return uxt_theme_add_font_table(path.c_str());
    }

    /// The table of most tests: the left half in a light and a dark blue.
    uxt_color_table_h blueTable() {
        return colourTable(R"(<color class="card/left" light="#8080FF" dark="#000040"/>)");
    }

    /// Application-wide, as an application sets itself up.
    void apply(uxt_color_table_h table) {
        uxt_theme_set_changeable_ui_enabled(EINA_TRUE);
        uxt_theme_set_style(UXT_THEME_STYLE_DEVICE);
        uxt_theme_set_color_table(table);
    }

    unsigned int pixel(int x, int y) { return screen().picture().pixel(x, y); }

    static constexpr unsigned int red = 0xC80000;
    static constexpr unsigned int green = 0x00C800;
    static constexpr unsigned int lightBlue = 0x8080FF;
    static constexpr unsigned int darkBlue = 0x000040;

    support::TemporaryDevice device_;

private:
    int tables_ = 0;
};
