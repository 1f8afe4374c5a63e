#include "CacheTest.h"

using namespace manager_log;
using kest_files::contents;
using testing::Contains;
using testing::ElementsAre;
using testing::IsEmpty;
using testing::Pair;
using namespace preference_calls;

TEST_F(Cache, IsNotWrittenForATipWhoseFileGoesDuringTheLoad) {
    writeTip("<title>Title</title>");
    const auto tip = resources() / tipPath;
    meanwhile["KestCurrentLanguage"] = [&tip] { std::filesystem::remove(tip); };
    const auto records = load();
    ASSERT_EQ(records.size(), 1U);
    EXPECT_EQ(records[0].menuTitle, "");
    EXPECT_THAT(errors(), ElementsAre(error("__loadDetailMenu", "Failed to access: -1, " + tip.string())));
    EXPECT_THAT(log(), Contains(info("loadContentsList", "__loadDetailMenu failed : " + kest)));
    EXPECT_EQ(preference("contents_tip.xml_menuTitle"), std::nullopt);
}

TEST_F(Cache, OfATipHasTheStringsOfOneBeforeItWhoseFileWentDuringTheLoad) {
    writeMenus({{}, {"contents/other.xml"}});
    writeDetail("<title>Gone</title>");
    writeStrings({{"en", "IDS_MINE", "Mine"}});
    writeDetail("<title id=\"IDS_MINE\">untranslated</title>", "contents/other.xml");
    const auto tip = resources() / tipPath;
    meanwhile["KestCurrentLanguage"] = [&tip] { std::filesystem::remove(tip); };
    EXPECT_EQ(load().at(1).menuTitle, "Mine");
    EXPECT_THAT(errors(), ElementsAre(error("__loadDetailMenu", "Failed to access: -1, " + tip.string())));
}

TEST_F(Cache, IsWrittenFieldByFieldAfterEachTip) {
    addApplication("com.example.clock");
    writeMenus({{"contents/sub/clock.xml", "com.example.clock"}});
    writeDetail("<textdomain>tips</textdomain><title>Title</title><appname>Clock</appname><image>a.png</image>"
                "<launchappid>com.example.alarm</launchappid><launchparamkey>key</launchparamkey>"
                "<launchparamvalue>value</launchparamvalue>" +
                    contents("Text"),
                "contents/sub/clock.xml", "com.example.clock");
    written.clear();
    load();
    const std::string base = "contents_sub_clock.xml";
    const std::string folder = resources("com.example.clock").string() + "/";
    EXPECT_THAT(written, ElementsAre(Pair("KestPackageVersion", ""), Pair("KestCurrentLanguage", "en_US.UTF-8"),
                                     Pair(base + "_textdomain", "tips"), Pair(base + "_menuTitle", "Title"),
                                     Pair(base + "_textContents", "Text"), Pair(base + "_imagePath", folder + "a.png"),
                                     Pair(base + "_iconPath", device()->packages().find("com.example.clock")->icon),
                                     Pair(base + "_appName", "Clock"), Pair(base + "_launchAppid", "com.example.alarm"),
                                     Pair(base + "_launchParamKey", "key"), Pair(base + "_launchParamValue", "value"),
                                     Pair("KestPackageVersion", "1.0.0")));
}

TEST_F(Cache, GetsNoVersionAtTheEndWhereThePackageHasNone) {
    writeTip("<title>A</title>");
    upgradeTo("");
    written.clear();
    load();
    EXPECT_EQ(std::ranges::count(written, "KestPackageVersion", [](const auto& entry) { return entry.first; }), 1)
        << "the empty one at the beginning";
}

TEST_F(Cache, GetsTheVersionThatThePackageHasAtTheEnd) {
    writeTip("<title>A</title>");
    meanwhile["contents_tip.xml_launchParamValue"] = [this] { upgradeTo("3.0.0"); };
    load();
    EXPECT_EQ(preference("KestPackageVersion"), "3.0.0");
}

TEST_F(Cache, HoldsEmptyFieldsToo) {
    loadTip("<title>Title</title>");
    EXPECT_EQ(preference("contents_tip.xml_appName"), "");
    EXPECT_EQ(preference("contents_tip.xml_launchParamValue"), "");
    EXPECT_EQ(preference("contents_tip.xml_textContents"), "No Contents");
}

TEST_F(Cache, HoldsNeitherPathNorApplicationNorTitleId) {
    loadTip("<title id=\"IDS_OWN\">x</title>");
    for (const char* field : {"_path", "_appid", "_isAvailable", "_titleId"})
        EXPECT_EQ(preference(std::string("contents_tip.xml") + field), std::nullopt) << field;
}

TEST_F(Cache, IsNotWrittenForABrokenTip) {
    writeMenus({{}});
    support::writeFile(resources() / tipPath, "");
    load();
    EXPECT_EQ(preference("contents_tip.xml_menuTitle"), std::nullopt);
    EXPECT_EQ(preference("KestPackageVersion"), "1.0.0");
}

TEST_F(Cache, ServesTheNextStart) {
    fill();
    const auto records = loadAtNextStart();
    EXPECT_TRUE(result());
    EXPECT_THAT(titles(records), ElementsAre("Cached"));
    EXPECT_THAT(log(), ElementsAre(begin("loadContentsList"), begin("__loadMainMenu"), hit("__getFromPreference")));
}

TEST_F(Cache, GivesBackItsNineFields) {
    addApplication("com.example.clock");
    writeMenus({{"contents/clock.xml", "com.example.clock"}});
    writeDetail("<textdomain>tips</textdomain><title>Title</title><appname>Clock</appname><image>a.png</image>"
                "<launchappid>com.example.alarm</launchappid><launchparamkey>key</launchparamkey>"
                "<launchparamvalue>value</launchparamvalue>" +
                    contents("Text"),
                "contents/clock.xml", "com.example.clock");
    const KestContentInfo full = load().at(0);
    const KestContentInfo cached = loadAtNextStart().at(0);
    ASSERT_FALSE(loadedFromFiles());
    EXPECT_EQ(cached.path, full.path);
    EXPECT_EQ(cached.appid, full.appid);
    EXPECT_EQ(cached.isAvailable, full.isAvailable);
    EXPECT_EQ(cached.menuTitle, "Title");
    EXPECT_EQ(cached.textContents, "Text");
    EXPECT_EQ(cached.imagePath, full.imagePath);
    EXPECT_EQ(cached.textdomain, "tips");
    EXPECT_EQ(cached.iconPath, full.iconPath);
    EXPECT_EQ(cached.appName, "Clock");
    EXPECT_EQ(cached.launchAppid, "com.example.alarm");
    EXPECT_EQ(cached.launchParamKey, "key");
    EXPECT_EQ(cached.launchParamValue, "value");
}

TEST_F(Cache, DoesNotKeepTheTitlesId) {
    EXPECT_EQ(loadTip("<title id=\"IDS_OWN\">x</title>").titleId, "IDS_OWN");
    EXPECT_EQ(loadAtNextStart().at(0).titleId, "");
}

TEST_F(Cache, IsReadFieldByFieldInTheSameOrder) {
    fill();
    loadAtNextStart();
    const std::string base = "contents_tip.xml";
    EXPECT_THAT(asked,
                ElementsAre("KestCurrentLanguage", "KestPackageVersion", base + "_textdomain", base + "_menuTitle",
                            base + "_textContents", base + "_imagePath", base + "_iconPath", base + "_appName",
                            base + "_launchAppid", base + "_launchParamKey", base + "_launchParamValue"));
    EXPECT_THAT(written, IsEmpty());
}

TEST_F(Cache, NeedsNoDetailOrStringFileToBeSound) {
    fill();
    support::writeFile(resources() / tipPath, "broken");
    support::writeFile(resources() / "contents/tip-string.xml", "broken");
    EXPECT_THAT(titles(loadAtNextStart()), ElementsAre("Cached"));
    EXPECT_THAT(errors(), IsEmpty());
}

TEST_F(Cache, LeavesAFieldEmptyThatItHoldsEmpty) {
    fill();
    setPreference("contents_tip.xml_menuTitle", "");
    EXPECT_THAT(titles(loadAtNextStart()), ElementsAre(""));
    EXPECT_FALSE(loadedFromFiles());
}

TEST_F(Cache, LeavesAMenuBlankThatItHasNeverSeen) {
    fill();
    writeDetail("<title>New</title>", "contents/new.xml");
    writeMenus({{}, {"contents/new.xml"}});
    const auto records = loadAtNextStart();
    ASSERT_EQ(records.size(), 2U);
    EXPECT_EQ(records[1].path, "contents/new.xml");
    EXPECT_EQ(records[1].menuTitle, "");
    EXPECT_EQ(records[1].textContents, "");
    EXPECT_FALSE(loadedFromFiles());
}

TEST_F(Cache, IsSharedByMenusOfTheSamePath) {
    addApplication("com.example.clock");
    writeMenus({{tipPath, kest}, {tipPath, "com.example.clock"}});
    writeDetail("<title>Of Kest</title>");
    writeDetail("<title>Of the clock</title>", tipPath, "com.example.clock");
    EXPECT_THAT(titles(load()), ElementsAre("Of Kest", "Of the clock"));
    EXPECT_THAT(titles(loadAtNextStart()), ElementsAre("Of the clock", "Of the clock"));
}

TEST_F(Cache, IsSharedByPathsThatDifferInSlashesOnly) {
    writeMenus({{"contents/a/b.xml"}, {"contents/a_b.xml"}});
    writeDetail("<title>Slash</title>", "contents/a/b.xml");
    writeDetail("<title>Underscore</title>", "contents/a_b.xml");
    load();
    EXPECT_THAT(titles(loadAtNextStart()), ElementsAre("Underscore", "Underscore"));
}

TEST_F(Cache, AsksForTheIconAfresh) {
    addApplication("com.example.clock");
    writeMenus({{tipPath, "com.example.clock"}});
    writeDetail("<title>Clock</title>", tipPath, "com.example.clock");
    load();
    setPreference("contents_tip.xml_iconPath", "/old/icon.png");
    EXPECT_EQ(loadAtNextStart().at(0).iconPath, device()->packages().find("com.example.clock")->icon);
    ASSERT_FALSE(loadedFromFiles());
}

TEST_F(Cache, KeepsNoIconThatTheDeviceNoLongerKnows) {
    fill();
    setPreference("contents_tip.xml_iconPath", "/old/icon.png");
    device::faults::plan("package_info_create", -5, 100);
    EXPECT_EQ(loadAtNextStart().at(0).iconPath, "No icon Path");
    EXPECT_FALSE(loadedFromFiles());
}
