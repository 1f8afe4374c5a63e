#include "CatalogueTest.h"

#include <regex>

using namespace manager_log;
using kest_files::contents;
using kest_files::textTag;
using testing::Contains;
using testing::ElementsAre;
using testing::IsEmpty;

class StringFile : public CatalogueTest {
protected:
    /// The title that a tip gets by that id ("untranslated" when nothing knows it).
    std::string titleOf(const std::string& id) {
        return loadTip("<title id=\"" + id + "\">untranslated</title>").menuTitle;
    }
    void writeFile(const std::string& text) { support::writeFile(resources() / "contents/tip-string.xml", text); }
};

TEST_F(StringFile, MayBeMissing) {
    EXPECT_EQ(titleOf("IDS_MINE"), "untranslated");
    EXPECT_THAT(log(), ElementsAre(begin("loadContentsList"), begin("__loadMainMenu"), begin("__loadDetailMenu"),
                                   begin("__loadStringResource"), hit("__saveToPreference")));
}

TEST_F(StringFile, TranslatesByItsStrings) {
    writeStrings({{"en_US", "IDS_MINE", "Mine"}});
    EXPECT_EQ(titleOf("IDS_MINE"), "Mine");
    EXPECT_THAT(log(), ElementsAre(begin("loadContentsList"), begin("__loadMainMenu"), begin("__loadDetailMenu"),
                                   begin("__loadStringResource"),
                                   info("__loadStringResource", kest + " use self string resource"),
                                   hit("__saveToPreference")));
}

TEST_F(StringFile, LiesBesideTheDetailFileOfItsApplication) {
    addApplication("com.example.clock");
    kest_files::Menu menu{"contents/clock.xml", "com.example.clock"};
    writeMenus({menu});
    writeDetail("<title id=\"IDS_MINE\">untranslated</title>", menu.path, menu.appid);
    writeStrings({{"en_US", "IDS_MINE", "Mine"}}, "contents/clock-string.xml", menu.appid);
    EXPECT_EQ(load().at(0).menuTitle, "Mine");
    EXPECT_THAT(log(), Contains(info("__loadStringResource", "com.example.clock use self string resource")));
}

TEST_F(StringFile, OfAnApplicationThatIsNotInstalledLiesInTheFixedFolder) {
    writeMenus({{"contents/strings.xml", "com.example.gone"}});
    EXPECT_EQ(load().at(0).menuTitle, "From the fixed folder's strings");
}

TEST_F(StringFile, IsNamedByTheFirstXmlOfThePath) {
    kest_files::Menu menu{"contents/tip.xml.d/tip.xml"};
    writeMenus({menu});
    writeDetail("<title id=\"IDS_MINE\">untranslated</title>", menu.path);
    writeStrings({{"en_US", "IDS_MINE", "Mine"}}, "contents/tip-string.xml.d/tip.xml");
    EXPECT_EQ(load().at(0).menuTitle, "Mine");
}

TEST_F(StringFile, IsNamedByTheFirstXmlOfTheFolderToo) {
    const std::string appid = "com.example.xmlviewer";
    addApplication(appid);
    writeMenus({{"contents/tip.xml", appid}});
    writeDetail("<title id=\"IDS_MINE\">untranslated</title>", "contents/tip.xml", appid);
    writeStrings({{"en_US", "IDS_MINE", "Mine"}}, "contents/any.xml", appid);
    // As the rule has it, be it a folder where nobody would look.
    const std::filesystem::path shifted =
        std::regex_replace(resources(appid).string(), std::regex("\\.xml"), "-string.xml");
    std::filesystem::create_directories(shifted / "contents");
    std::filesystem::rename(resources(appid) / "contents/any.xml", shifted / "contents/tip.xml");
    EXPECT_EQ(load().at(0).menuTitle, "Mine");
}

TEST_F(StringFile, IsTheDetailFileItselfWhenThatIsNoXmlByItsName) {
    kest_files::Menu menu{"contents/tip"};
    writeMenus({menu});
    support::writeFile(resources() / menu.path,
                       "<tip><items><item><title id=\"IDS_MINE\">untranslated</title><region>en</region>"
                       "<stringid>IDS_MINE</stringid><value>Mine</value></item></items></tip>");
    EXPECT_EQ(load().at(0).menuTitle, "Mine");
}

TEST_F(StringFile, PrefersTheFirstFiveLettersOfTheLanguage) {
    writeStrings({{"en", "IDS_MINE", "Two letters"}, {"en_US", "IDS_MINE", "Five letters"}});
    EXPECT_EQ(titleOf("IDS_MINE"), "Five letters");
}

TEST_F(StringFile, FallsBackToTheFirstTwoLettersOfTheLanguage) {
    writeStrings({{"en", "IDS_MINE", "Two letters"}, {"en_GB", "IDS_MINE", "Another country"}});
    EXPECT_EQ(titleOf("IDS_MINE"), "Two letters");
}

TEST_F(StringFile, CountsLettersInALanguageOfThreeToo) {
    writeStrings({{"fil", "IDS_MINE", "Three letters"}, {"fil_PH", "IDS_MINE", "Six"}, {"fi", "IDS_MINE", "Two"}});
    setLanguage("fil_PH.UTF-8");
    EXPECT_EQ(titleOf("IDS_MINE"), "Two");
    writeStrings({{"fil_P", "IDS_MINE", "Five letters"}});
    EXPECT_EQ(titleOf("IDS_MINE"), "Five letters");
}

TEST_F(StringFile, PutsRegionAndIdTogetherAsOneName) {
    writeStrings({{"en", "US_IDS_MINE", "Mine"}});
    EXPECT_EQ(titleOf("IDS_MINE"), "Mine");
}

TEST_F(StringFile, TakesOfAnEntryTheLastOfEachElement) {
    writeFile("<strings><items><item><region>ko</region><stringid>IDS_A</stringid><value>A</value>"
              "<region>en_US</region><stringid>IDS_B</stringid><value>B</value></item></items></strings>");
    EXPECT_EQ(titleOf("IDS_B"), "B");
    EXPECT_EQ(titleOf("IDS_A"), "untranslated");
}

TEST_F(StringFile, FollowsTheDevicesLanguage) {
    writeStrings({{"en", "IDS_MINE", "Mine"}, {"ko_KR", "IDS_MINE", "내 것"}, {"ko", "IDS_MINE", "다른"}});
    EXPECT_EQ(titleOf("IDS_MINE"), "Mine");
    setLanguage("ko_KR.UTF-8");
    EXPECT_EQ(titleOf("IDS_MINE"), "내 것");
}

TEST_F(StringFile, HasNothingForAnotherLanguage) {
    writeStrings({{"ru", "IDS_MINE", "Моё"}, {"", "IDS_MINE", "No region"}});
    EXPECT_EQ(titleOf("IDS_MINE"), "untranslated");
}

TEST_F(StringFile, IsNoHelpWhenTheDeviceNamesNoLanguage) {
    writeStrings({{"en_US", "IDS_MINE", "Mine"}, {"", "IDS_MINE", "No region"}});
    device()->settings().remove(device::keys::language);
    EXPECT_EQ(titleOf("IDS_MINE"), "untranslated");
    EXPECT_EQ(loadContents(textTag("IDS_MINE")), "IDS_MINE");
}

TEST_F(StringFile, MayHoldALanguageOfFewerLetters) {
    writeStrings({{"e", "IDS_MINE", "Short"}});
    setLanguage("e");
    EXPECT_EQ(titleOf("IDS_MINE"), "Short");
}

TEST_F(StringFile, LetsALaterEntryOverwriteAnEarlierOne) {
    writeStrings({{"en_US", "IDS_MINE", "First"}, {"en_US", "IDS_MINE", "Second"}});
    EXPECT_EQ(titleOf("IDS_MINE"), "Second");
}

TEST_F(StringFile, ServesTheMenusAfterItToo) {
    writeMenus({{"contents/a.xml"}, {"contents/b.xml"}});
    writeDetail("<title>A</title>", "contents/a.xml");
    writeStrings({{"en_US", "IDS_MINE", "Of the menu before"}}, "contents/a-string.xml");
    writeDetail("<title id=\"IDS_MINE\">untranslated</title>", "contents/b.xml");
    EXPECT_THAT(titles(load()), ElementsAre("A", "Of the menu before"));
}

TEST_F(StringFile, IsRememberedWhenItHasGone) {
    writeStrings({{"en_US", "IDS_MINE", "Mine"}});
    titleOf("IDS_MINE");
    std::filesystem::remove(resources() / "contents/tip-string.xml");
    EXPECT_EQ(titleOf("IDS_MINE"), "Mine");
}

TEST_F(StringFile, TakesItsTextsAsTheyStand) {
    writeStrings({{" en_US", "IDS_MINE", "Mine"}, {"en_US", " IDS_OTHER ", " Other "}});
    EXPECT_EQ(titleOf("IDS_MINE"), "untranslated");
    EXPECT_EQ(titleOf("IDS_OTHER"), "untranslated");
    EXPECT_EQ(titleOf(" IDS_OTHER "), " Other ");
}

TEST_F(StringFile, DoesNotKeepAnEntryWithoutAnId) {
    writeStrings({{"en_US", "", "Nothing's text"}});
    EXPECT_EQ(titleOf(""), "untranslated");
    // Under its region alone it would pass for that language's text of this id.
    EXPECT_EQ(titleOf("US_"), "untranslated");
}

TEST_F(StringFile, MayHoldAnEmptyText) {
    writeStrings({{"en_US", "IDS_MINE", ""}});
    EXPECT_EQ(titleOf("IDS_MINE"), "");
}

TEST_F(StringFile, StartsEveryEntryAfresh) {
    writeFile("<strings><items><item><region>en_US</region><stringid>IDS_A</stringid><value>A</value></item>"
              "<item><region>en_US</region><stringid>IDS_B</stringid></item></items></strings>");
    EXPECT_EQ(titleOf("IDS_B"), "");
}

TEST_F(StringFile, StartsEveryEntryWithoutRegionAndId) {
    writeFile(
        "<strings><items><item><region>en_US</region><stringid>IDS_A</stringid><value>A</value></item>"
        "<item><stringid>IDS_B</stringid><value>B</value></item><item><region>en_US</region><value>C</value></item>"
        "</items></strings>");
    EXPECT_EQ(titleOf("IDS_A"), "A");
    EXPECT_EQ(titleOf("IDS_B"), "untranslated");
}

TEST_F(StringFile, MayHaveNothingButATextInItsRoot) {
    writeFile("<strings>text</strings>");
    EXPECT_EQ(titleOf("IDS_MINE"), "untranslated");
    EXPECT_THAT(errors(), IsEmpty());
}

TEST_F(StringFile, ReadsTheFirstItemsOnlyAndSkipsOtherChildren) {
    writeFile("<any><other/><items>text<other/><!-- c --><item><other>x</other><stringid>IDS_A</stringid>"
              "<value>A</value><region>en_US</region></item></items><items><item><region>en_US</region>"
              "<stringid>IDS_B</stringid><value>B</value></item></items></any>");
    EXPECT_EQ(titleOf("IDS_A"), "A");
    EXPECT_EQ(titleOf("IDS_B"), "untranslated");
}

TEST_F(StringFile, TakesNothingThatLiesDeeper) {
    const auto item = [](const std::string& id) {
        return "<item><region>en_US</region><stringid>" + id + "</stringid><value>" + id + " found</value></item>";
    };
    writeFile("<strings><old><items>" + item("IDS_A") + "</items></old><items><group>" + item("IDS_B") + "</group>" +
              item("IDS_C") + "</items></strings>");
    EXPECT_EQ(titleOf("IDS_A"), "untranslated");
    EXPECT_EQ(titleOf("IDS_B"), "untranslated");
    EXPECT_EQ(titleOf("IDS_C"), "IDS_C found");
}

TEST_F(StringFile, MayLackItems) {
    writeFile("<strings><other/></strings>");
    EXPECT_EQ(titleOf("IDS_MINE"), "untranslated");
    EXPECT_THAT(errors(), IsEmpty());
}

TEST_F(StringFile, IsLeftOutWhenItIsNoXml) {
    writeFile("");
    EXPECT_EQ(titleOf("IDS_MINE"), "untranslated");
    EXPECT_THAT(errors(), ElementsAre(error("__loadStringResource", "Failed to xmlReadFile")));
    EXPECT_THAT(log(), Contains(info("__loadStringResource", kest + " use self string resource")));
    EXPECT_TRUE(result());
}

TEST_F(StringFile, IsLeftOutWhenItHasNoRoot) {
    writeFile("no element");
    EXPECT_EQ(titleOf("IDS_MINE"), "untranslated");
    EXPECT_THAT(errors(), ElementsAre(error("__loadStringResource", "Empty document")));
}

TEST_F(StringFile, IsLeftOutWhenItsRootHasNoChildren) {
    writeFile("<strings/>");
    EXPECT_EQ(titleOf("IDS_MINE"), "untranslated");
    EXPECT_THAT(errors(), ElementsAre(error("__loadStringResource", "Empty document")));
}

TEST_F(StringFile, LeavesWhatIsKnownWhenItBreaks) {
    writeStrings({{"en_US", "IDS_MINE", "Mine"}});
    titleOf("IDS_MINE");
    writeFile("");
    EXPECT_EQ(titleOf("IDS_MINE"), "Mine");
}

TEST_F(StringFile, IsReadBeforeTheDetailFileThatNeedsIt) {
    writeStrings({{"en_US", "IDS_MINE", "Mine"}});
    EXPECT_EQ(loadTip("<title id=\"IDS_MINE\">x</title>" + contents(textTag("IDS_MINE") + " and <br/>")).textContents,
              "Mine and <br/>");
}

TEST_F(StringFile, IsNoHelpOnceTheDeviceNamesNoLanguageAnyMore) {
    writeStrings({{"en_US", "IDS_MINE", "Mine"}});
    ASSERT_EQ(loadTip("<title id=\"IDS_MINE\">untranslated</title>").menuTitle, "Mine");
    device()->settings().remove(device::keys::language);
    EXPECT_EQ(load().at(0).menuTitle, "untranslated");
}
