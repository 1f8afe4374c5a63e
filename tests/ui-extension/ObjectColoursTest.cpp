#include "ChangeableTest.h"

#include <gmock/gmock.h>

namespace {

using testing::ElementsAre;

class ObjectColours : public ChangeableTest {
protected:
    void applyTo(Evas_Object* object, uxt_color_table_h table, int style = UXT_THEME_STYLE_DEVICE) {
        uxt_theme_object_set_changeable_ui_enabled(object, EINA_TRUE);
        uxt_theme_object_set_color_table(object, table);
        uxt_theme_object_set_style(object, style);
    }

    uxt_color_table_h yellowTable() {
        return colourTable(R"(<color class="card/left" light="#FFFF00" dark="#404000"/>)");
    }

    static constexpr unsigned int lightYellow = 0xFFFF00;
};

TEST_F(ObjectColours, ChangeThatObjectOnly) {
    Evas_Object* own = layout("card");
    layout("card", {200, 0});
    applyTo(own, blueTable());
    EXPECT_EQ(lightBlue, pixel(10, 10));
    EXPECT_EQ(red, pixel(210, 10));
}

TEST_F(ObjectColours, WinOverTheApplicationsAlsoWhenThoseComeLater) {
    Evas_Object* own = layout("card");
    layout("card", {200, 0});
    applyTo(own, blueTable());
    apply(yellowTable());
    EXPECT_EQ(lightBlue, pixel(10, 10));
    EXPECT_EQ(lightYellow, pixel(210, 10));
}

TEST_F(ObjectColours, FollowTheDevicesTheme) {
    Evas_Object* own = layout("card");
    applyTo(own, blueTable());
    uxt::applyDeviceTheme(true);
    EXPECT_EQ(darkBlue, pixel(10, 10));
    uxt::applyDeviceTheme(false);
    EXPECT_EQ(lightBlue, pixel(10, 10));
}

TEST_F(ObjectColours, ADarkObjectInALightApplicationUsesTheApplicationsTable) {
    uxt::applyDeviceTheme(false);
    apply(blueTable());
    Evas_Object* own = layout("card");
    Evas_Object* page = layout("device-page", {200, 0});
    for (Evas_Object* each : {own, page}) {
        uxt_theme_object_set_changeable_ui_enabled(each, EINA_TRUE);
        uxt_theme_object_set_style(each, UXT_THEME_STYLE_DARK);
    }
    layout("card", {400, 0});
    EXPECT_EQ(darkBlue, pixel(10, 10));
    EXPECT_EQ(0x101010u, pixel(210, 10));
    EXPECT_EQ(lightBlue, pixel(410, 10));
}

TEST_F(ObjectColours, EndWhenTheyAreDisabledAndWhenTheTableIsDeleted) {
    Evas_Object* own = layout("card");
    const auto table = blueTable();
    applyTo(own, table);
    uxt_theme_object_set_changeable_ui_enabled(own, EINA_FALSE);
    EXPECT_EQ(red, pixel(10, 10));
    uxt_theme_object_set_changeable_ui_enabled(own, EINA_TRUE);
    EXPECT_EQ(lightBlue, pixel(10, 10));
    uxt_theme_delete_color_table(table);
    EXPECT_EQ(red, pixel(10, 10));
}

TEST_F(ObjectColours, ReachTheLayoutsInsideAlsoThoseThatComeLater) {
    Evas_Object* own = layout("card");
    Evas_Object* first = layout("card", {0, 0}, own);
    elm_object_part_content_set(own, "content", first);
    applyTo(own, blueTable());
    EXPECT_EQ(lightBlue, pixel(10, 60));
    Evas_Object* second = layout("card", {0, 0}, own);
    elm_object_part_content_set(own, "content", second);
    EXPECT_EQ(lightBlue, pixel(10, 60));
}

TEST_F(ObjectColours, ReachTheRowsOfAListAsTheyComeIntoSight) {
    elm_theme_extension_add(nullptr, THEMES "/card.edj");
    Evas_Object* list = elm_genlist_add(window());
    evas_object_geometry_set(list, 0, 0, 720, 1280);
    evas_object_show(list);
    applyTo(list, blueTable());
    Elm_Genlist_Item_Class* row = elm_genlist_item_class_new();
    row->item_style = "card";
    for (int i = 0; i < 40; ++i)
        elm_genlist_item_append(list, row, nullptr, nullptr, ELM_GENLIST_ITEM_NONE, nullptr, nullptr);
    elm_genlist_item_class_free(row);
    test_ui::runFor(0.5);
    EXPECT_EQ(lightBlue, pixel(300, 50));
    screen().swipe({300, 1000}, {300, 300});
    test_ui::runFor(3);
    const auto picture = screen().picture();
    EXPECT_EQ(lightBlue, picture.pixel(300, 50));
    EXPECT_EQ(lightBlue, picture.pixel(300, 1200));
}

TEST_F(ObjectColours, OfAnObjectInsideAnotherAreItsOwn) {
    Evas_Object* outer = layout("card");
    Evas_Object* inner = layout("card", {0, 0}, outer);
    elm_object_part_content_set(outer, "content", inner);
    applyTo(outer, colourTable(R"(<color class="card/left" light="#8080FF" dark="#000040"/>
                                  <color class="card/right" light="#FFFFFF" dark="#FFFFFF"/>)"));
    EXPECT_EQ(0xFFFFFFu, pixel(90, 60));
    applyTo(inner, yellowTable());
    EXPECT_EQ(lightBlue, pixel(10, 10));
    EXPECT_EQ(lightYellow, pixel(10, 60));
    EXPECT_EQ(green, pixel(90, 60));
}

TEST_F(ObjectColours, EndWithTheObject) {
    Evas_Object* own = layout("card");
    const auto table = blueTable();
    applyTo(own, table);
    EXPECT_EQ(lightBlue, pixel(10, 10));
    evas_object_del(own);
    uxt::applyDeviceTheme(true);
    uxt_theme_delete_color_table(table);
    layout("card");
    EXPECT_EQ(red, pixel(10, 10));
}

TEST_F(ObjectColours, NoObjectIsSaid) {
    uxt_theme_object_set_color_table(nullptr, nullptr);
    EXPECT_THAT(device_.logMessages(), ElementsAre("E UXT uxt_theme_object_set_color_table: no object"));
}

}  // namespace
