#include "ListTest.h"

#include <sys/stat.h>

using kest_files::Menu;
using testing::ElementsAre;
using testing::Pair;

using Rows = ListTest;

TEST_F(Rows, AreATitleAndOneForEachMenu) {
    writeTips({"A", "B", "C"});
    start();
    EXPECT_EQ(topView(), "KestMainView");
    ASSERT_EQ(test_ui::rows(list()).size(), 4U);
    EXPECT_EQ(text(titleRow(), "elm.text.main"), "Tips and guidelines");
    EXPECT_THAT(menuTexts(), ElementsAre(Pair("Name of A", "A"), Pair("Name of B", "B"), Pair("Name of C", "C")));
}

TEST_F(Rows, AreTheTitleOnlyWhenThereAreNoMenus) {
    writeMenus({});
    start();
    ASSERT_EQ(test_ui::rows(list()).size(), 1U);
    EXPECT_EQ(text(titleRow(), "elm.text.main"), "Tips and guidelines");
}

TEST_F(Rows, AreTheTitleOnlyWhenThereIsNoCatalogue) {
    start();
    EXPECT_EQ(test_ui::rows(list()).size(), 1U);
    EXPECT_EQ(topView(), "KestMainView");
}

TEST_F(Rows, ShowTheTextsAsTheyAreStored) {
    writeTip("<title>IDS_OWN &lt;b&gt; A &amp; B</title><appname>IDS_OWN</appname>");
    start();
    EXPECT_THAT(menuTexts(), ElementsAre(Pair("IDS_OWN", "IDS_OWN <b> A & B")));
}

TEST_F(Rows, ShowAMenuWithoutTexts) {
    writeTip("<title></title>");
    start();
    EXPECT_THAT(menuTexts(), ElementsAre(Pair("", "")));
}

TEST_F(Rows, HaveTheirClasses) {
    writeTips({"A"});
    start();
    const auto& rows = calls::made().rows;
    ASSERT_EQ(rows.size(), 2U);
    const Elm_Genlist_Item_Class& title = *rows[0].itemClass;
    EXPECT_STREQ(title.item_style, "groupindex");
    EXPECT_NE(title.func.text_get, nullptr);
    EXPECT_EQ(title.func.content_get, nullptr);
    EXPECT_EQ(title.func.del, nullptr);
    EXPECT_EQ(rows[0].data, nullptr);
    EXPECT_EQ(rows[0].parent, nullptr);
    EXPECT_EQ(rows[0].select, nullptr);
    EXPECT_EQ(rows[0].type, ELM_GENLIST_ITEM_NONE);
    const Elm_Genlist_Item_Class& menu = *rows[1].itemClass;
    EXPECT_STREQ(menu.item_style, "2line.bottom");
    EXPECT_NE(menu.func.text_get, nullptr);
    EXPECT_NE(menu.func.content_get, nullptr);
    EXPECT_NE(menu.func.del, nullptr);
    EXPECT_NE(rows[1].data, nullptr);
    EXPECT_EQ(rows[1].parent, nullptr);
    EXPECT_EQ(rows[1].selectData, naviframe().getTopView());
    EXPECT_EQ(rows[1].type, ELM_GENLIST_ITEM_NONE);
}

TEST_F(Rows, HaveNothingForPartsThatTheyDoNotKnow) {
    writeTips({"A"});
    start();
    const calls::Row menu = calls::made().rows.at(1);
    void* data = const_cast<void*>(menu.data);
    EXPECT_EQ(menu.itemClass->func.text_get(data, list(), "elm.text"), nullptr);
    EXPECT_EQ(menu.itemClass->func.content_get(data, list(), "elm.icon.2"), nullptr);
    newLog();
    const calls::Row title = calls::made().rows.at(0);
    EXPECT_EQ(title.itemClass->func.text_get(nullptr, list(), "elm.text.end"), nullptr);
    EXPECT_THAT(newLog(), ElementsAre(list_log::info("__getTitleText", "part:elm.text.end")));
}

TEST_F(Rows, ShowTheIconsOfTheirApplications) {
    const std::string icon = drawIcon(0);
    writeTips({"A"});
    start();
    Evas_Object* holder = elm_object_item_part_content_get(menuRow(0), "elm.icon.1");
    ASSERT_NE(holder, nullptr);
    const char* group = nullptr;
    edje_object_file_get(elm_layout_edje_get(holder), nullptr, &group);
    EXPECT_STREQ(group, "elm/layout/list/B/type.2/default");
    Evas_Object* image = elm_object_part_content_get(holder, "elm.swallow.content");
    const char* file = nullptr;
    const char* key = nullptr;
    elm_image_file_get(image, &file, &key);
    EXPECT_EQ(file, icon);
    for (Evas_Object* object : {holder, image}) {
        double x = 0, y = 0;
        evas_object_size_hint_align_get(object, &x, &y);
        EXPECT_THAT(std::make_pair(x, y), Pair(EVAS_HINT_FILL, EVAS_HINT_FILL));
        evas_object_size_hint_weight_get(object, &x, &y);
        EXPECT_THAT(std::make_pair(x, y), Pair(EVAS_HINT_EXPAND, EVAS_HINT_EXPAND));
    }
}

TEST_F(Rows, DrawTheIconThatIsThere) {
    constexpr unsigned int red = 0xff0000;
    drawIcon(red);
    writeTips({"A"});
    start();
    EXPECT_GT(screen().picture().count(red, test_ui::rowGeometry(menuRow(0))), 1000);
}

TEST_F(Rows, ShowTheirTextsWithoutAnIcon) {
    writeMenus({{"contents/fallback.xml", ""}});
    start();
    EXPECT_EQ(elm_object_item_part_content_get(menuRow(0), "elm.icon.1"), nullptr);
    EXPECT_THAT(menuTexts(), ElementsAre(Pair("", "From the fixed folder")));
}

TEST_F(Rows, ShowNoPictureWhereTheIconCannotBeFound) {
    writeMenus({{"contents/fallback.xml", "com.example.gone"}});
    start();
    EXPECT_THAT(menuTexts(), ElementsAre(Pair("", "From the fixed folder")));
    Evas_Object* holder = elm_object_item_part_content_get(menuRow(0), "elm.icon.1");
    ASSERT_NE(holder, nullptr);
    int width = 0, height = 0;
    elm_image_object_size_get(elm_object_part_content_get(holder, "elm.swallow.content"), &width, &height);
    EXPECT_EQ(width, 0);
    EXPECT_EQ(height, 0);
}

TEST_F(Rows, FillTheListAsItIsSetUp) {
    writeTips({"A"});
    start();
    EXPECT_EQ(elm_genlist_mode_get(list()), ELM_LIST_COMPRESS);
    EXPECT_TRUE(elm_genlist_homogeneous_get(list()));
    double x = 0, y = 0;
    evas_object_size_hint_weight_get(list(), &x, &y);
    EXPECT_THAT(std::make_pair(x, y), Pair(EVAS_HINT_EXPAND, EVAS_HINT_EXPAND));
    evas_object_size_hint_align_get(list(), &x, &y);
    EXPECT_THAT(std::make_pair(x, y), Pair(EVAS_HINT_FILL, EVAS_HINT_FILL));
    EXPECT_TRUE(evas_object_visible_get(list()));
    EXPECT_EQ(calls::made().updates, 1);
    evas_object_size_hint_weight_get(naviframe().getTopView()->getEvasObj(), &x, &y);
    EXPECT_THAT(std::make_pair(x, y), Pair(EVAS_HINT_EXPAND, EVAS_HINT_EXPAND));
}

TEST_F(Rows, ComeBeforeTheTitleAndThatBeforeTheNewsOfPackages) {
    writeTips({"A", "B"});
    start();
    EXPECT_THAT(calls::made().steps, ElementsAre("row", "row", "row", "title", "package manager"));
}

TEST_F(Rows, LieInTheListsGroupOfTheApplicationsTheme) {
    writeTips({"A"});
    start();
    Evas_Object* layout = naviframe().getTopView()->getEvasObj();
    const char *file = nullptr, *group = nullptr;
    edje_object_file_get(elm_layout_edje_get(layout), &file, &group);
    EXPECT_EQ(file, (device().appRoot() / "res/edje/kest.edj").string());
    EXPECT_STREQ(group, "kest/list/main");
    EXPECT_EQ(elm_object_part_content_get(layout, "elm.swallow.content"), list());
    EXPECT_THAT(calls::made().themeExtensions, ElementsAre((device().appRoot() / "res/edje/kest.edj").string()));
}

TEST_F(Rows, LieBelowTheApplicationsName) {
    writeTips({"A"});
    start();
    Elm_Object_Item* item = naviframe().getTopView()->getNaviItem();
    EXPECT_EQ(text(item, "elm.text.title"), "Tips");
    EXPECT_STREQ(elm_object_item_translatable_part_text_get(item, "elm.text.title"),
                 "IDS_KESTS_BODY_KESTS_M_APPLICATION_NAME");
    EXPECT_EQ(elm_object_item_part_content_get(item, "elm.swallow.prev_btn"), nullptr);
    EXPECT_EQ(elm_object_item_part_content_get(item, "elm.swallow.next_btn"), nullptr);
}

TEST_F(Rows, LieBelowANameOfTheDomainThatHasIt) {
    start();
    EXPECT_THAT(calls::made().translatableTexts,
                ElementsAre("elm.text.title: IDS_KESTS_BODY_KESTS_M_APPLICATION_NAME of kest"));
}

TEST_F(Rows, LieBelowANameOfContactsWhereTheApplicationHasNone) {
    // There are no texts of the application's own in this language.
    setLanguage("de_DE.UTF-8");
    start();
    EXPECT_THAT(calls::made().translatableTexts,
                ElementsAre("elm.text.title: IDS_KESTS_BODY_KESTS_M_APPLICATION_NAME of contacts"));
}

TEST_F(Rows, MayBe15000) {
    writeDetail("<title>Title</title>");
    writeMenus(std::vector<Menu>(15000));
    setPreference("KestCurrentLanguage", "en_US.UTF-8");
    setPreference("KestPackageVersion", "1.0.0");
    setPreference("contents_tip.xml_menuTitle", "Cached");
    start();
    EXPECT_EQ(test_ui::rows(list()).size(), 15001U);
    elm_genlist_item_show(menuRow(14999), ELM_GENLIST_ITEM_SCROLLTO_IN);
    settle();
    EXPECT_EQ(texts(menuRow(14999)), Texts("", "Cached"));
}

TEST_F(Rows, DoNotWaitForAnIconThatIsNoFile) {
    const std::string icon = device()->packages().find(kest)->icon;
    std::filesystem::create_directories(std::filesystem::path(icon).parent_path());
    ASSERT_EQ(mkfifo(icon.c_str(), 0600), 0);
    writeTips({"A"});
    start();
    EXPECT_THAT(menuTexts(), ElementsAre(Pair("Name of A", "A")));
}

TEST_F(Rows, ShowNoPictureWhereTheIconIsAFolder) {
    std::filesystem::create_directories(device()->packages().find(kest)->icon);
    writeTips({"A"});
    start();
    EXPECT_THAT(menuTexts(), ElementsAre(Pair("Name of A", "A")));
}

TEST_F(Rows, ShowTextsThatAreNoProperUnicode) {
    support::writeFile(resources() / tipPath, "<tip><items><item><title>caf\xe9</title></item></items></tip>");
    writeMenus({{}});
    start();
    EXPECT_EQ(test_ui::rows(list()).size(), 2U);
    screen().picture();
}

TEST_F(Rows, WithoutDataAreErrorLines) {
    writeTips({"A"});
    start();
    const Elm_Genlist_Item_Class& menu = *calls::made().rows.at(1).itemClass;
    newLog();
    EXPECT_EQ(menu.func.text_get(nullptr, list(), "elm.text.main.left.bottom"), nullptr);
    EXPECT_EQ(menu.func.content_get(nullptr, list(), "elm.icon.1"), nullptr);
    EXPECT_THAT(newLog(), ElementsAre(list_log::error("__getRowText", "data is null"),
                                      list_log::error("__getRowContent", "data is null")));
}
