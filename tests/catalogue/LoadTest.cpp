#include "CatalogueTest.h"

#include <libxml/parser.h>

#include <cstdlib>

using namespace manager_log;
using testing::ElementsAre;
using testing::HasSubstr;
using testing::IsEmpty;

using Load = CatalogueTest;

class FirstLoad : public CatalogueTest {
protected:
    FirstLoad() : CatalogueTest(false) {}
};

TEST_F(Load, GivesOneManager) {
    EXPECT_EQ(KestContentMgr::getInstance(), KestContentMgr::getInstance());
}

TEST_F(FirstLoad, HappensWhenTheManagerIsAskedFor) {
    writeTip("<title>First</title>");
    KestContentMgr* manager = KestContentMgr::getInstance();
    EXPECT_THAT(titles(manager->getContentsList()), ElementsAre("First"));
    EXPECT_THAT(kest_log::all(device()),
                ElementsAre(begin("KestContentMgr"), begin("loadContentsList"), begin("__loadMainMenu"),
                            begin("__loadDetailMenu"), begin("__loadStringResource"), hit("__saveToPreference")));
}

TEST_F(FirstLoad, TakesAValidCache) {
    writeTip("<title>From the file</title>");
    setPreference("KestCurrentLanguage", "en_US.UTF-8");
    setPreference("KestPackageVersion", "1.0.0");
    setPreference("contents_tip.xml_menuTitle", "Cached");
    EXPECT_THAT(titles(KestContentMgr::getInstance()->getContentsList()), ElementsAre("Cached"));
}

TEST_F(Load, LeavesATraceOfEveryStep) {
    writeTip("<title>A</title>");
    load();
    EXPECT_TRUE(result());
    EXPECT_THAT(log(), ElementsAre(begin("loadContentsList"), begin("__loadMainMenu"), begin("__loadDetailMenu"),
                                   begin("__loadStringResource"), hit("__saveToPreference")));
}

TEST_F(Load, WritesItsLinesAsTheConventionsSay) {
    writeTip("<title>A</title>");
    load();
    const std::vector<std::string> messages = device().logMessages();
    EXPECT_THAT(messages,
                testing::Contains(testing::MatchesRegex(
                    "I KEST KestContentMgr\\.cpp: loadContentsList\\([0-9]+\\) > .\\[0;32mBEGIN >>>>.\\[0;m")));
    EXPECT_THAT(messages,
                testing::Contains(testing::MatchesRegex("I KEST KestContentMgr\\.cpp: __saveToPreference\\([0-9]+\\) > "
                                                        ".\\[0;34m>>>HIT<<<.\\[0;m")));
}

TEST_F(Load, TakesTheMenusInTheirOrder) {
    writeMenus({{"contents/b.xml"}, {"contents/a.xml"}});
    writeDetail("<title>B</title>", "contents/b.xml");
    writeDetail("<title>A</title>", "contents/a.xml");
    EXPECT_THAT(titles(load()), ElementsAre("B", "A"));
}

TEST_F(Load, ReplacesWhatWasThereBefore) {
    writeTip("<title>Before</title>");
    load();
    writeTip("<title>After</title>");
    EXPECT_THAT(titles(load()), ElementsAre("After"));
}

TEST_F(Load, MayFindNoMenus) {
    writeMenus({});
    EXPECT_THAT(load(), IsEmpty());
    EXPECT_TRUE(result());
    EXPECT_THAT(log(), ElementsAre(begin("loadContentsList"), begin("__loadMainMenu")));
}

TEST_F(Load, NamesTheApplicationOfABrokenTipAndKeepsItsMenu) {
    addApplication("com.example.clock");
    writeMenus({{"contents/clock.xml", "com.example.clock"}, {}});
    support::writeFile(resources("com.example.clock") / "contents/clock.xml", "");
    writeDetail("<title>Next</title>");
    const auto records = load();
    EXPECT_TRUE(result());
    ASSERT_EQ(records.size(), 2U);
    EXPECT_EQ(records[0].path, "contents/clock.xml");
    EXPECT_EQ(records[0].appid, "com.example.clock");
    EXPECT_TRUE(records[0].isAvailable);
    EXPECT_EQ(records[0].menuTitle, "");
    EXPECT_EQ(records[0].textContents, "");
    EXPECT_EQ(records[0].iconPath, "");
    EXPECT_EQ(records[1].menuTitle, "Next");
    EXPECT_THAT(log(),
                ElementsAre(begin("loadContentsList"), begin("__loadMainMenu"), begin("__loadDetailMenu"),
                            begin("__loadStringResource"), error("__loadDetailMenu", "Failed to xmlReadFile"),
                            info("loadContentsList", "__loadDetailMenu failed : com.example.clock"),
                            begin("__loadDetailMenu"), begin("__loadStringResource"), hit("__saveToPreference")));
}

TEST_F(Load, CallsTheApplicationOfABrokenTipUnknownWhenItHasNone) {
    // Without an application's id the tip lies in the application's own fixed folder.
    writeMenus({{"contents/broken.xml", ""}});
    load();
    EXPECT_THAT(log(), testing::Contains(info("loadContentsList", "__loadDetailMenu failed : Unknown")));
}

TEST_F(Load, MarksTheCacheWithLanguageAndVersion) {
    upgradeTo("2.7.1");
    setLanguage("ko_KR.UTF-8");
    writeTip("<title>A</title>");
    load();
    EXPECT_EQ(preference("KestCurrentLanguage"), "ko_KR.UTF-8");
    EXPECT_EQ(preference("KestPackageVersion"), "2.7.1");
}

TEST_F(Load, HasNoVersionWhileItRuns) {
    setPreference("KestPackageVersion", "1.0.0");
    writeTip("<title>A</title>");
    upgradeTo("");
    load();
    EXPECT_EQ(preference("KestPackageVersion"), "") << "an empty version is not written at the end";
}

TEST_F(Load, LeavesTheLanguageMarkWhenTheDeviceNamesNone) {
    setPreference("KestCurrentLanguage", "ru_RU.UTF-8");
    device()->settings().remove(device::keys::language);
    writeTip("<title>A</title>");
    load();
    EXPECT_EQ(preference("KestCurrentLanguage"), "ru_RU.UTF-8");
}

TEST_F(Load, GivesTheParserBackToTheRestOfTheProcess) {
    writeTip("<title>A</title>");
    load();
    EXPECT_EQ(xmlStructuredError, nullptr) << "messages about other files are not the catalogue's";
    const std::filesystem::path other = resources() / "other.xml";
    support::writeFile(other, "<other/>");
    const std::unique_ptr<xmlDoc, decltype(&xmlFreeDoc)> document(xmlReadFile(other.c_str(), nullptr, 0), xmlFreeDoc);
    ASSERT_NE(document, nullptr);
    EXPECT_STREQ(reinterpret_cast<const char*>(xmlDocGetRootElement(document.get())->name), "other");
}

/// Ends the process as a finished application does, with the log on standard error.
[[noreturn]] static void endWithLog(const support::TemporaryDevice& device) {
    static const support::TemporaryDevice* logged = &device;
    std::atexit([] {
        for (const std::string& line : logged->logMessages())
            std::fprintf(stderr, "%s\n", line.c_str());
    });
    KestContentMgr::getInstance();
    std::exit(0);
}

TEST_F(FirstLoad, IsFollowedByATraceWhenTheProcessEnds) {
    writeMenus({});
    EXPECT_EXIT(endWithLog(device()), testing::ExitedWithCode(0),
                HasSubstr("> \x1b[0;32mBEGIN >>>>\x1b[0;m\nI KEST KestContentMgr.cpp: ~KestContentMgr("));
}
