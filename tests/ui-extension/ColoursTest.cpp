#include "ChangeableTest.h"

#include <gmock/gmock.h>

namespace {

using testing::ElementsAre;

class Colours : public ChangeableTest {};

TEST_F(Colours, ATableRecoloursALiveLayoutAndLeavesOtherClassesAlone) {
    layout("card");
    EXPECT_EQ(red, pixel(10, 10));
    apply(blueTable());
    EXPECT_EQ(lightBlue, pixel(10, 10));
    EXPECT_EQ(green, pixel(90, 10));
}

TEST_F(Colours, ALayoutThatComesLaterHasTheTablesColours) {
    apply(blueTable());
    layout("card");
    EXPECT_EQ(lightBlue, pixel(10, 10));
}

TEST_F(Colours, TheDevicesThemeChoosesTheColour) {
    layout("card");
    apply(blueTable());
    uxt::applyDeviceTheme(true);
    uxt::themeChanged();
    EXPECT_EQ(darkBlue, pixel(10, 10));
    uxt::applyDeviceTheme(false);
    uxt::themeChanged();
    EXPECT_EQ(lightBlue, pixel(10, 10));
}

TEST_F(Colours, AStyleOfItsOwnKeepsTheApplicationDark) {
    layout("card");
    layout("device-page", {200, 0});
    uxt::applyDeviceTheme(false);
    apply(blueTable());
    EXPECT_EQ(0xF0F0F0u, pixel(210, 10));
    uxt_theme_set_style(UXT_THEME_STYLE_DARK);
    EXPECT_EQ(darkBlue, pixel(10, 10));
    EXPECT_EQ(0x101010u, pixel(210, 10));
    uxt_theme_set_style(UXT_THEME_STYLE_LIGHT);
    uxt::applyDeviceTheme(true);
    EXPECT_EQ(lightBlue, pixel(10, 10));
    EXPECT_EQ(0xF0F0F0u, pixel(210, 10));
}

TEST_F(Colours, NothingChangesUntilTablesAreEnabled) {
    layout("card");
    uxt_theme_set_color_table(blueTable());
    EXPECT_EQ(red, pixel(10, 10));
    uxt_theme_set_changeable_ui_enabled(EINA_TRUE);
    EXPECT_EQ(lightBlue, pixel(10, 10));
    uxt_theme_set_changeable_ui_enabled(EINA_FALSE);
    EXPECT_EQ(red, pixel(10, 10));
}

TEST_F(Colours, DeletingATableRestoresTheFilesColours) {
    layout("card");
    const auto table = blueTable();
    apply(table);
    EXPECT_EQ(lightBlue, pixel(10, 10));
    uxt_theme_delete_color_table(table);
    EXPECT_EQ(red, pixel(10, 10));
}

TEST_F(Colours, AnotherTableTakesThePlaceOfTheFirst) {
    layout("card");
    apply(blueTable());
    uxt_theme_set_color_table(colourTable(R"(<color class="card/right" light="#FFFF00" dark="#404000"/>)"));
    EXPECT_EQ(red, pixel(10, 10));
    EXPECT_EQ(0xFFFF00u, pixel(90, 10));
}

TEST_F(Colours, ATransparentColourLetsThroughWhatLiesBehind) {
    Evas_Object* behind = evas_object_rectangle_add(screen().canvas());
    evas_object_color_set(behind, 64, 64, 64, 255);
    evas_object_geometry_set(behind, 0, 0, 100, 100);
    evas_object_show(behind);
    layout("card");
    apply(colourTable(R"(<color class="card/left" light="#C8000080" dark="#000000"/>)"));
    EXPECT_EQ(0x842020u, pixel(10, 10));
}

TEST_F(Colours, AnApplicationsTableWinsOverTheDevicesTheme) {
    layout("device-page");
    uxt::applyDeviceTheme(false);
    EXPECT_EQ(0xF0F0F0u, pixel(10, 10));
    const auto table = colourTable(R"(<color class="device/page" light="#FFEEDD" dark="#332211"/>)");
    apply(table);
    EXPECT_EQ(0xFFEEDDu, pixel(10, 10));
    uxt::applyDeviceTheme(true);
    EXPECT_EQ(0x332211u, pixel(10, 10));
    uxt_theme_delete_color_table(table);
    EXPECT_EQ(0x101010u, pixel(10, 10));
}

TEST_F(Colours, ATableOrAStyleThatDoesNotExistIsSaidAndChangesNothing) {
    layout("card");
    apply(blueTable());
    const auto deleted = blueTable();
    uxt_theme_delete_color_table(deleted);
    uxt_theme_set_color_table(deleted);
    uxt_theme_set_style(3);
    uxt_theme_set_style(-1);
    EXPECT_EQ(lightBlue, pixel(10, 10));
    EXPECT_THAT(device_.logMessages(), ElementsAre("E UXT uxt_theme_set_color_table: there is no such colour table",
                                                   "E UXT uxt_theme_set_style: there is no style 3",
                                                   "E UXT uxt_theme_set_style: there is no style -1"));
}

}  // namespace
