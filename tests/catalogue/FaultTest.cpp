#include "CatalogueTest.h"

#include <app_manager.h>
#include <app_preference.h>
#include <package_info.h>

using namespace manager_log;
using device::faults::plan;
using kest_files::textTag;
using testing::Contains;
using testing::ElementsAre;
using testing::IsEmpty;

/// What the platform may refuse, and what the catalogue is then.
class Fault : public CatalogueTest {
protected:
    static constexpr int ever = 1000000;
};

TEST_F(Fault, OfAllPreferenceWritesIsIgnored) {
    plan("preference_set_string", PREFERENCE_ERROR_IO_ERROR, ever);
    EXPECT_EQ(loadTip("<title>Title</title>").menuTitle, "Title");
    EXPECT_TRUE(result());
    EXPECT_THAT(errors(), IsEmpty());
    EXPECT_THAT(warnings(), IsEmpty());
    EXPECT_TRUE(device()->preferences().all(kest).empty());
}

TEST_F(Fault, OfOnePreferenceWriteIsIgnored) {
    plan("preference_set_string", PREFERENCE_ERROR_IO_ERROR, 1, 3);
    loadTip("<title>Title</title>");
    EXPECT_EQ(preference("contents_tip.xml_textdomain"), "");
    EXPECT_EQ(preference("contents_tip.xml_menuTitle"), std::nullopt);
    EXPECT_EQ(preference("contents_tip.xml_textContents"), "No Contents");
    EXPECT_EQ(preference("KestPackageVersion"), "1.0.0");
}

TEST_F(Fault, OfAllPreferenceReadsLoadsFromTheFiles) {
    loadTip("<title>Title</title>");
    plan("preference_get_string", PREFERENCE_ERROR_IO_ERROR, ever);
    EXPECT_THAT(titles(load(false)), ElementsAre("Title"));
    EXPECT_THAT(log(), ElementsAre(begin("loadContentsList"), begin("__loadMainMenu"), begin("__loadDetailMenu"),
                                   begin("__loadStringResource"), hit("__saveToPreference")));
}

TEST_F(Fault, OfOneFieldsReadLeavesTheFieldEmpty) {
    loadTip("<title>Title</title><appname>Name</appname>");
    // Language, version, then the fields in their order: the second is the title.
    plan("preference_get_string", PREFERENCE_ERROR_IO_ERROR, 1, 3);
    const KestContentInfo record = load(false).at(0);
    EXPECT_EQ(record.menuTitle, "");
    EXPECT_EQ(record.textContents, "No Contents");
    EXPECT_EQ(record.appName, "Name");
}

TEST_F(Fault, OfTheVersionsReadLeavesTheCacheValid) {
    loadTip("<title>Title</title>");
    upgradeTo("2.0.0");
    plan("preference_get_string", PREFERENCE_ERROR_IO_ERROR, 1, 1);
    load(false);
    EXPECT_THAT(log(), ElementsAre(begin("loadContentsList"), begin("__loadMainMenu"), hit("__getFromPreference")));
}

TEST_F(Fault, OfTheDisplayLanguageMeansLanguageChanged) {
    loadTip("<title>Title</title>");
    plan("vconf_get_str", -1, ever);
    EXPECT_THAT(titles(load(false)), ElementsAre("Title"));
    EXPECT_THAT(log(), Contains(info("__checkCacheAvailable", "Language changed")));
    EXPECT_EQ(preference("KestCurrentLanguage"), "en_US.UTF-8");
}

TEST_F(Fault, OfTheDisplayLanguageLeavesIdsUntranslated) {
    writeStrings({{"en_US", "IDS_MINE", "Mine"}});
    plan("vconf_get_str", -1, ever);
    EXPECT_EQ(loadContents(textTag("IDS_MINE") + " " + textTag("IDS_OWN")), "IDS_MINE Own text");
    EXPECT_TRUE(result());
}

TEST_F(Fault, OfTheCountryMeansGlobal) {
    setCountry("IN");
    writeTip("<title>Title</title>");
    plan("vconf_get_str", -1);
    EXPECT_THAT(titles(load()), ElementsAre("Title"));
}

TEST_F(Fault, OfThePackagesVersionIsAWarningAndLeavesTheCacheInvalid) {
    plan("package_manager_get_package_info", PACKAGE_MANAGER_ERROR_IO_ERROR, ever);
    loadTip("<title>Title</title>");
    EXPECT_THAT(warnings(), ElementsAre(warning("__getPackageVersion", "package_manager_get_package_info error")));
    EXPECT_TRUE(result());
    EXPECT_EQ(preference("KestPackageVersion"), "");
}

TEST_F(Fault, OfThePackagesVersionInvalidatesTheCache) {
    loadTip("<title>Title</title>");
    plan("package_manager_get_package_info", PACKAGE_MANAGER_ERROR_IO_ERROR);
    load(false);
    EXPECT_THAT(log(), Contains(warning("__getPackageVersion", "package_manager_get_package_info error")));
    EXPECT_THAT(log(), Contains(info("__checkCacheAvailable", "Version changed!!")));
    EXPECT_EQ(preference("KestPackageVersion"), "1.0.0");
}

TEST_F(Fault, OfReadingTheVersionLeavesTheCacheInvalidWithoutALine) {
    plan("package_info_get_version", PACKAGE_MANAGER_ERROR_IO_ERROR, ever);
    loadTip("<title>Title</title>");
    EXPECT_THAT(warnings(), IsEmpty());
    EXPECT_EQ(preference("KestPackageVersion"), "");
}

TEST_F(Fault, OfTheSharedFolderReadsTheFixedOne) {
    plan("app_manager_get_shared_resource_path", APP_MANAGER_ERROR_IO_ERROR, ever);
    const auto records = load();
    EXPECT_TRUE(result());
    ASSERT_EQ(records.size(), 1U);
    EXPECT_EQ(records[0].path, "contents/fallback.xml");
    EXPECT_EQ(records[0].menuTitle, "From the fixed folder");
    EXPECT_EQ(records[0].imagePath, KEST_APP_ROOT "/shared/res/images/a.png");
}

TEST_F(Fault, OfTheMainMenusFolderReadsTheFixedMainMenuOnly) {
    writeTip("<title>Title</title>");
    writeDetail("<title>From the package</title>", "contents/fallback.xml");
    plan("app_manager_get_shared_resource_path", APP_MANAGER_ERROR_IO_ERROR);
    EXPECT_THAT(paths(load()), ElementsAre("contents/fallback.xml"));
}

TEST_F(Fault, OfOneReadOfTheDisplayLanguageIsForgottenAtTheNext) {
    writeStrings({{"en_US", "IDS_A", "Apple"}, {"en_US", "IDS_B", "Pear"}});
    // The region, the language of the cache, then that of the texts.
    plan("vconf_get_str", -1, 2, 1);
    EXPECT_EQ(loadContents(textTag("IDS_A") + " " + textTag("IDS_B")), "IDS_A Pear");
}

TEST_F(Fault, OfOneReadOfTheCountryIsForgottenAtTheNext) {
    setCountry("IN");
    writeDetail("<title>A</title>", "contents/a.xml");
    writeDetail("<title>B</title>", "contents/b.xml");
    writeMenus({{"contents/a.xml"}, {"contents/b.xml", kest, "India"}});
    plan("vconf_get_str", -1);
    EXPECT_THAT(titles(load()), ElementsAre("A", "B"));
}

TEST_F(Fault, OfOneLookForTheSharedFolderIsForgottenAtTheNext) {
    addApplication("com.example.clock");
    writeMenus({{"contents/fallback.xml", "com.example.clock"}});
    writeDetail("<title>Own</title><image>a.png</image>", "contents/fallback.xml", "com.example.clock");
    // The main menu's, then the one that tells whether the tip is there: the fixed folder has it too.
    plan("app_manager_get_shared_resource_path", APP_MANAGER_ERROR_IO_ERROR, 1, 1);
    const KestContentInfo record = load().at(0);
    EXPECT_EQ(record.menuTitle, "Own");
    EXPECT_EQ(record.imagePath, (resources("com.example.clock") / "a.png").string());
}
