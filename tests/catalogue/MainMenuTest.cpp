#include "CatalogueTest.h"

using kest_files::mainMenu;
using kest_files::Menu;
using testing::ElementsAre;
using testing::IsEmpty;

class MainMenu : public CatalogueTest {
protected:
    /// Writes the detail file, so that the menu is kept if only its state allows it.
    Menu menu(const std::string& path, const std::string& state = "Global") {
        writeDetail("<title>Title of " + path + "</title>", path);
        return {path, kest, state};
    }
    std::vector<std::string> loadedPaths() { return paths(load()); }
    void writeMainMenu(const std::string& text) { support::writeFile(mainMenuFile(), text); }
};

TEST_F(MainMenu, FillsPathApplicationAndAvailability) {
    writeMenus({menu("contents/a.xml")});
    const auto records = load();
    ASSERT_EQ(records.size(), 1U);
    EXPECT_EQ(records[0].path, "contents/a.xml");
    EXPECT_EQ(records[0].appid, kest);
    EXPECT_TRUE(records[0].isAvailable);
    EXPECT_TRUE(result());
}

TEST_F(MainMenu, KeepsTheOrderOfTheFile) {
    writeMenus({menu("contents/c.xml"), menu("contents/a.xml"), menu("contents/b.xml")});
    EXPECT_THAT(loadedPaths(), ElementsAre("contents/c.xml", "contents/a.xml", "contents/b.xml"));
}

TEST_F(MainMenu, IsReadAnewAtEveryLoad) {
    writeMenus({menu("contents/a.xml"), menu("contents/b.xml")});
    load();
    writeMenus({menu("contents/b.xml")});
    EXPECT_THAT(loadedPaths(), ElementsAre("contents/b.xml"));
}

TEST_F(MainMenu, TakesTheDetailFileOfTheMenusOwnApplication) {
    addApplication("com.example.clock");
    writeDetail("<title>Clock</title>", "contents/clock.xml", "com.example.clock");
    writeMenus({{"contents/clock.xml", "com.example.clock"}});
    EXPECT_THAT(titles(load()), ElementsAre("Clock"));
}

TEST_F(MainMenu, TakesAnyRootAndSkipsOtherChildren) {
    menu("contents/a.xml");
    writeMainMenu("<anything><!-- first --><other/><menus>text<other/>" + Menu{"contents/a.xml"}.xml() +
                  "<!-- last --></menus></anything>");
    EXPECT_THAT(loadedPaths(), ElementsAre("contents/a.xml"));
}

TEST_F(MainMenu, ReadsTheFirstMenusElementOnly) {
    menu("contents/a.xml");
    menu("contents/b.xml");
    writeMainMenu("<tips><menus>" + Menu{"contents/a.xml"}.xml() + "</menus><menus>" + Menu{"contents/b.xml"}.xml() +
                  "</menus></tips>");
    EXPECT_THAT(loadedPaths(), ElementsAre("contents/a.xml"));
}

TEST_F(MainMenu, TakesNothingThatLiesDeeper) {
    for (const char* path : {"contents/a.xml", "contents/b.xml", "contents/c.xml"})
        menu(path);
    writeMainMenu("<tips><old><menus>" + Menu{"contents/a.xml"}.xml() + "</menus></old><menus><group>" +
                  Menu{"contents/b.xml"}.xml() + "</group>" + Menu{"contents/c.xml"}.xml() + "</menus></tips>");
    EXPECT_THAT(loadedPaths(), ElementsAre("contents/c.xml"));
}

TEST_F(MainMenu, IgnoresUnknownChildrenOfAMenu) {
    menu("contents/a.xml");
    writeMainMenu(mainMenu("<menu>text<colour>red</colour><path>contents/a.xml</path><!-- c --><appid>" + kest +
                           "</appid><state>Global</state></menu>"));
    EXPECT_THAT(loadedPaths(), ElementsAre("contents/a.xml"));
    EXPECT_THAT(warnings(), IsEmpty());
}

TEST_F(MainMenu, TakesItsTextsAsTheyStand) {
    menu("contents/a.xml");
    writeMenus({{" contents/a.xml"}, {"contents/a.xml ", kest}, {"contents/a.xml", " " + kest}});
    EXPECT_THAT(loadedPaths(), IsEmpty());
    EXPECT_EQ(warnings().size(), 3U);
}

TEST_F(MainMenu, LetsALaterElementOverrideAnEarlierOne) {
    menu("contents/b.xml");
    writeMainMenu(mainMenu("<menu><state>NOK</state><path>contents/a.xml</path><appid>none</appid>"
                           "<path>contents/b.xml</path><appid>" +
                           kest + "</appid><state>Global</state></menu>"));
    EXPECT_THAT(loadedPaths(), ElementsAre("contents/b.xml"));
}

TEST_F(MainMenu, LetsALaterNokOverrideAnEarlierRegion) {
    menu("contents/a.xml");
    writeMainMenu(mainMenu("<menu><path>contents/a.xml</path><appid>" + kest +
                           "</appid><state>Global</state><state>NOK</state></menu>"));
    EXPECT_THAT(loadedPaths(), IsEmpty());
}

TEST_F(MainMenu, LetsALaterRegionOverrideAnEarlierOne) {
    menu("contents/a.xml");
    writeMainMenu(mainMenu("<menu><path>contents/a.xml</path><appid>" + kest +
                           "</appid><state>Global</state><state>India</state></menu>"));
    EXPECT_THAT(loadedPaths(), IsEmpty());
}

TEST_F(MainMenu, KnowsItsElementsAndRegionsByTheirLettersAsTheyStand) {
    for (const char* path : {"contents/a.xml", "contents/b.xml", "contents/c.xml"})
        menu(path);
    writeMainMenu(mainMenu("<menu><path>contents/a.xml</path><appid>" + kest + "</appid><state>global</state></menu>" +
                           "<Menu><path>contents/b.xml</path><appid>" + kest + "</appid><state>Global</state></Menu>" +
                           "<menu><path>contents/c.xml</path><Path>contents/b.xml</Path><appid>" + kest +
                           "</appid><state>Global</state></menu>"));
    EXPECT_THAT(loadedPaths(), ElementsAre("contents/c.xml"));
}

TEST_F(MainMenu, StartsEveryMenuAfresh) {
    menu("contents/a.xml");
    writeMainMenu(mainMenu(Menu{"contents/a.xml"}.xml() + "<menu><path>contents/a.xml</path></menu>"));
    EXPECT_THAT(loadedPaths(), ElementsAre("contents/a.xml"));
}

TEST_F(MainMenu, StartsEveryMenuWithoutPathAndApplication) {
    menu("contents/a.xml");
    writeMainMenu(mainMenu(Menu{"contents/a.xml", kest}.xml() +
                           "<menu><path>contents/fallback.xml</path><state>Global</state></menu>"
                           "<menu><appid>com.example.other</appid><state>Global</state></menu>"));
    const auto records = load();
    ASSERT_THAT(paths(records), ElementsAre("contents/a.xml", "contents/fallback.xml", ""));
    EXPECT_EQ(records[1].appid, "");
    EXPECT_EQ(records[2].appid, "com.example.other");
}

TEST_F(MainMenu, DropsNokInEveryRegionWithoutALine) {
    writeMenus({menu("contents/a.xml", "NOK")});
    for (const char* country : {"KR", "IN", "RU", "ID", "NP", "ZA"}) {
        setCountry(country);
        EXPECT_THAT(loadedPaths(), IsEmpty()) << country;
        EXPECT_THAT(warnings(), IsEmpty()) << country;
        EXPECT_TRUE(result());
    }
}

TEST_F(MainMenu, TakesNokForARegionsNameUnlessItIsTheWholeText) {
    writeMenus({menu("contents/a.xml", "NOK Global"), menu("contents/b.xml", " NOK")});
    EXPECT_THAT(loadedPaths(), ElementsAre("contents/a.xml"));
}

TEST_F(MainMenu, NeverShowsAMenuWithoutState) {
    menu("contents/a.xml");
    writeMainMenu(mainMenu("<menu><path>contents/a.xml</path><appid>" + kest + "</appid></menu>"));
    EXPECT_THAT(loadedPaths(), IsEmpty());
    EXPECT_THAT(warnings(), IsEmpty());
    EXPECT_TRUE(result());
}

TEST_F(MainMenu, NeverShowsAMenuOfAnEmptyState) {
    writeMenus({menu("contents/a.xml", "")});
    EXPECT_THAT(loadedPaths(), IsEmpty());
}

TEST_F(MainMenu, OffersAMenuInEveryRegionThatItsStateLists) {
    writeMenus({menu("contents/a.xml", "Global,India,Russia,Indonesia")});
    for (const char* country : {"KR", "IN", "RU", "ID"}) {
        setCountry(country);
        EXPECT_THAT(loadedPaths(), ElementsAre("contents/a.xml")) << country;
    }
    setCountry("NP");
    EXPECT_THAT(loadedPaths(), IsEmpty());
}

TEST_F(MainMenu, OffersAMenuOfGlobalInGlobalOnly) {
    writeMenus({menu("contents/a.xml", "Global")});
    EXPECT_THAT(loadedPaths(), ElementsAre("contents/a.xml"));
    setCountry("IN");
    EXPECT_THAT(loadedPaths(), IsEmpty());
}

TEST_F(MainMenu, FindsARegionWithinALongerWord) {
    writeMenus({menu("contents/a.xml", "Indian")});
    setCountry("IN");
    EXPECT_THAT(loadedPaths(), ElementsAre("contents/a.xml"));
}

TEST_F(MainMenu, DoesNotOfferIndiasMenusInNepal) {
    writeMenus({menu("contents/a.xml", "India"), menu("contents/b.xml", "SWA")});
    setCountry("NP");
    EXPECT_THAT(loadedPaths(), ElementsAre("contents/b.xml"));
}

TEST_F(MainMenu, DropsAMenuWhoseDetailFileIsMissingWithAWarning) {
    writeMenus({menu("contents/a.xml"), {"contents/missing.xml", "com.example.app"}, menu("contents/b.xml")});
    EXPECT_THAT(loadedPaths(), ElementsAre("contents/a.xml", "contents/b.xml"));
    EXPECT_THAT(warnings(),
                ElementsAre(manager_log::warning("__loadMainMenu", "__loadMainMenu failed : com.example.app")));
    EXPECT_TRUE(result());
}

TEST_F(MainMenu, DoesNotLookForTheDetailFileOfAMenuThatIsNotOffered) {
    writeMenus({{"contents/missing.xml", kest, "India"}});
    EXPECT_THAT(loadedPaths(), IsEmpty());
    EXPECT_THAT(warnings(), IsEmpty());
}

TEST_F(MainMenu, MayHaveNoMenus) {
    writeMainMenu(mainMenu(""));
    EXPECT_THAT(load(), IsEmpty());
    EXPECT_TRUE(result());
    EXPECT_THAT(errors(), IsEmpty());
}

TEST_F(MainMenu, MayHaveNoMenusElement) {
    writeMainMenu("<tips><other/></tips>");
    EXPECT_THAT(load(), IsEmpty());
    EXPECT_TRUE(result());
    EXPECT_THAT(errors(), IsEmpty());
    EXPECT_THAT(warnings(), IsEmpty());
}

TEST_F(MainMenu, MayHaveNothingButABlankInItsRoot) {
    writeMainMenu("<tips>\n</tips>");
    EXPECT_THAT(load(), IsEmpty());
    EXPECT_TRUE(result());
    EXPECT_THAT(errors(), IsEmpty());
}

TEST_F(MainMenu, MustBeThere) {
    EXPECT_THAT(load(), IsEmpty());
    EXPECT_FALSE(result());
    EXPECT_THAT(log(),
                ElementsAre(manager_log::begin("loadContentsList"), manager_log::begin("__loadMainMenu"),
                            manager_log::error("__loadMainMenu", "Failed to access: -1, " + mainMenuFile().string()),
                            manager_log::info("loadContentsList", "__loadMainMenu failed")));
}

TEST_F(MainMenu, MustBeXml) {
    writeMainMenu("");
    EXPECT_THAT(load(), IsEmpty());
    EXPECT_FALSE(result());
    EXPECT_THAT(log(), ElementsAre(manager_log::begin("loadContentsList"), manager_log::begin("__loadMainMenu"),
                                   manager_log::error("__loadMainMenu", "Failed to xmlReadFile"),
                                   manager_log::info("loadContentsList", "__loadMainMenu failed")));
}

TEST_F(MainMenu, MustHaveARoot) {
    writeMainMenu("no element");
    EXPECT_THAT(load(), IsEmpty());
    EXPECT_FALSE(result());
    EXPECT_THAT(errors(), ElementsAre(manager_log::error("__loadMainMenu", "Empty document")));
}

TEST_F(MainMenu, MustHaveARootWithChildren) {
    writeMainMenu("<tips/>");
    EXPECT_THAT(load(), IsEmpty());
    EXPECT_FALSE(result());
    EXPECT_THAT(errors(), ElementsAre(manager_log::error("__loadMainMenu", "Empty document")));
}

TEST_F(MainMenu, EmptiesTheCatalogueWhenItHasGone) {
    writeMenus({menu("contents/a.xml")});
    ASSERT_EQ(load().size(), 1U);
    std::filesystem::remove(mainMenuFile());
    EXPECT_THAT(load(), IsEmpty());
    EXPECT_FALSE(result());
}

TEST_F(MainMenu, IsReadAsFarAsItCanBe) {
    menu("contents/a.xml");
    writeMainMenu("<tips><menus>" + Menu{"contents/a.xml"}.xml() + "<menu><path>contents/a");
    EXPECT_THAT(loadedPaths(), ElementsAre("contents/a.xml"));
    EXPECT_THAT(errors(), IsEmpty());
}

TEST_F(MainMenu, LeavesTheCacheAloneWhenItCannotBeRead) {
    setPreference("KestPackageVersion", "1.0.0");
    load();
    EXPECT_EQ(preference("KestPackageVersion"), "1.0.0");
}
