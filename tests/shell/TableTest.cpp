#include "ShellTest.h"

#include "KestCommon.h"

using testing::ElementsAre;
using testing::IsEmpty;

/// The changeable colour and font tables.
class Table : public ShellTest {
protected:
    static constexpr char color[] = "table/com.ravella.kest_ChangeableColorInfo.xml";
    static constexpr char font[] = "table/com.ravella.kest_ChangeableFontInfo.xml";

    bool set(Evas_Object* object = nullptr) { return KestCommon::setChangeableTable(object, &color_, &font_); }
    bool unset() { return KestCommon::unsetChangeableTable(&color_, &font_); }

    static std::vector<std::string> tableCalls() { return calls::madeOf({"uxt_theme_"}); }
    kest_log::Line begin() const { return kest_log::begin("KestCommon.cpp", "setChangeableTable"); }
    kest_log::Line info(const std::string& message) const {
        return kest_log::info("KestCommon.cpp", "setChangeableTable", message);
    }
    kest_log::Line error(const std::string& message) const {
        return kest_log::error("KestCommon.cpp", "setChangeableTable", message);
    }

    uxt_color_table_h color_ = nullptr;
    uxt_font_table_h font_ = nullptr;
};

TEST_F(Table, IsSetForTheWholeApplicationInOrder) {
    EXPECT_TRUE(set());
    EXPECT_NE(color_, nullptr);
    EXPECT_NE(font_, nullptr);
    EXPECT_THAT(tableCalls(), ElementsAre("uxt_theme_add_color_table " + resource(color),
                                          "uxt_theme_add_font_table " + resource(font),
                                          "uxt_theme_set_changeable_ui_enabled true", "uxt_theme_set_style 2",
                                          "uxt_theme_set_color_table table", "uxt_theme_set_font_table table"));
    unset();
}

TEST_F(Table, IsSetForOneObjectWithTheStyleAfterTheColours) {
    EXPECT_TRUE(set(window()));
    EXPECT_THAT(tableCalls(),
                ElementsAre("uxt_theme_add_color_table " + resource(color),
                            "uxt_theme_add_font_table " + resource(font),
                            "uxt_theme_object_set_changeable_ui_enabled object true",
                            "uxt_theme_object_set_color_table object table", "uxt_theme_object_set_style object 2",
                            "uxt_theme_object_set_font_table object table"));
    unset();
}

TEST_F(Table, IsResolvedForTheDisplayAndSaidInTheLog) {
    set();
    EXPECT_THAT(calls::madeOf({"app_resource_manager_get"}),
                ElementsAre(std::string("app_resource_manager_get 0 ") + color,
                            std::string("app_resource_manager_get 0 ") + font));
    EXPECT_THAT(newLog(), ElementsAre(begin(), info("color table path[" + resource(color) + "]"),
                                      info("font table path[" + resource(font) + "]")));
    unset();
}

TEST_F(Table, OfColoursThatCannotBeReadEndsIt) {
    calls::fail("uxt_theme_add_color_table");
    EXPECT_FALSE(set());
    EXPECT_EQ(color_, nullptr);
    EXPECT_EQ(font_, nullptr);
    EXPECT_THAT(tableCalls(), ElementsAre("uxt_theme_add_color_table " + resource(color)));
    EXPECT_THAT(kest_log::ofLevel('E', newLog()), ElementsAre(error("uxt_theme_add_color_table() is failed")));
}

TEST_F(Table, OfFontsThatCannotBeReadLeavesTheColoursThere) {
    calls::fail("uxt_theme_add_font_table");
    EXPECT_FALSE(set());
    EXPECT_NE(color_, nullptr);
    EXPECT_EQ(font_, nullptr);
    EXPECT_THAT(tableCalls(), ElementsAre("uxt_theme_add_color_table " + resource(color),
                                          "uxt_theme_add_font_table " + resource(font)));
    EXPECT_THAT(kest_log::ofLevel('E', newLog()), ElementsAre(error("uxt_theme_add_font_table() is failed")));
    unset();
}

TEST_F(Table, ThatCannotBeResolvedEndsIt) {
    calls::fail("app_resource_manager_get");
    EXPECT_FALSE(set());
    EXPECT_THAT(newLog(), ElementsAre(begin(), info("color table path[]"), info("font table path[]"),
                                      error("uxt_theme_add_color_table() is failed")));
}

TEST_F(Table, IsDeletedAndZeroed) {
    set();
    calls::forget();
    newLog();
    EXPECT_TRUE(unset());
    EXPECT_EQ(color_, nullptr);
    EXPECT_EQ(font_, nullptr);
    EXPECT_THAT(tableCalls(), ElementsAre("uxt_theme_delete_color_table table", "uxt_theme_delete_font_table table"));
    EXPECT_THAT(newLog(), ElementsAre(kest_log::hit("KestCommon.cpp", "unsetChangeableTable")));
}

TEST_F(Table, ThatIsNotThereNeedsNoDeletion) {
    EXPECT_TRUE(unset());
    EXPECT_THAT(tableCalls(), IsEmpty());
    EXPECT_THAT(newLog(), ElementsAre(kest_log::hit("KestCommon.cpp", "unsetChangeableTable")));
}

TEST_F(Table, OfColoursAloneIsDeletedAlone) {
    calls::fail("uxt_theme_add_font_table");
    set();
    calls::forget();
    EXPECT_TRUE(unset());
    EXPECT_THAT(tableCalls(), ElementsAre("uxt_theme_delete_color_table table"));
}
