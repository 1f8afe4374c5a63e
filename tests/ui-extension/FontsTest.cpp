#include "ChangeableTest.h"

namespace {

class Fonts : public ChangeableTest {
protected:
    static int heightOf(Evas_Object* layout) {
        int height = 0;
        edje_object_size_min_calc(elm_layout_edje_get(layout), nullptr, &height);
        return height;
    }

    uxt_font_table_h largeTable() { return fontTable(R"(<font class="card/text" font="Noto Sans" size="40"/>)"); }

    void applyFonts(uxt_font_table_h table) {
        uxt_theme_set_changeable_ui_enabled(EINA_TRUE);
        uxt_theme_set_font_table(table);
    }
};

TEST_F(Fonts, ATableChangesTheSizeOfALiveText) {
    Evas_Object* line = layout("line");
    const int height = heightOf(line);
    const auto before = screen().picture();
    const auto table = largeTable();
    applyFonts(table);
    EXPECT_NEAR(2 * height, heightOf(line), 2);
    EXPECT_NE(before, screen().picture());
    uxt_theme_delete_font_table(table);
    EXPECT_EQ(height, heightOf(line));
    EXPECT_EQ(before, screen().picture());
}

TEST_F(Fonts, APercentageScalesWhatTheFileSays) {
    Evas_Object* line = layout("line");
    const int height = heightOf(line);
    applyFonts(fontTable(R"(<font class="card/text" font="Noto Sans" size="200%"/>)"));
    EXPECT_NEAR(2 * height, heightOf(line), 2);
}

TEST_F(Fonts, ATableChangesTheFont) {
    Evas_Object* line = layout("line");
    const int height = heightOf(line);
    const auto before = screen().picture();
    applyFonts(fontTable(R"(<font class="card/text" font="Noto Sans:style=Bold" size="20"/>)"));
    EXPECT_NE(before, screen().picture());
    EXPECT_EQ(height, heightOf(line));
    applyFonts(fontTable(R"(<font class="card/text" font="Noto Sans" size="20"/>)"));
    EXPECT_EQ(before, screen().picture());
}

TEST_F(Fonts, OfOneObjectWinOverTheApplications) {
    Evas_Object* own = layout("line");
    Evas_Object* other = layout("line", {200, 0});
    const int height = heightOf(other);
    applyFonts(fontTable(R"(<font class="card/text" font="Noto Sans" size="10"/>)"));
    uxt_theme_object_set_changeable_ui_enabled(own, EINA_TRUE);
    uxt_theme_object_set_font_table(own, largeTable());
    EXPECT_NEAR(2 * height, heightOf(own), 2);
    EXPECT_NEAR(height / 2.0, heightOf(other), 2);
    uxt_theme_object_set_changeable_ui_enabled(own, EINA_FALSE);
    EXPECT_NEAR(height / 2.0, heightOf(own), 2);
}

}  // namespace
