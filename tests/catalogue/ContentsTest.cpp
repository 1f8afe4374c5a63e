#include "CatalogueTest.h"

using namespace manager_log;
using kest_files::cdata;
using kest_files::contents;
using kest_files::textTag;
using testing::Contains;

class Contents : public CatalogueTest {
protected:
    /// Contents of a tip whose title was translated by IDS_OWN, which makes them new style unless they hold that id.
    std::string loadNewStyle(const std::string& markup) {
        return loadTip("<title id=\"IDS_OWN\">x</title>" + contents(markup)).textContents;
    }
    bool wereOldStyle() const {
        return testing::Value(log(), Contains(info("__loadDetailMenu", "Old xml style, Need to manipulate")));
    }
    std::string attach(const std::string& id, const std::string& fragment) const {
        return "<attach id=\"" + id + "\">" + cdata(fragment) + "</attach>";
    }
    std::string folder() const { return resources().string() + "/"; }
};

TEST_F(Contents, OfANewTipAreOnlyTranslatedAndConverted) {
    EXPECT_EQ(loadNewStyle("<item href=file:a.png></item><br/>" + textTag("IDS_SYSTEM") + "<br>end"),
              "<item href=file:/" + folder() + "a.png></item><br/>System text<br>end");
    EXPECT_FALSE(wereOldStyle());
}

TEST_F(Contents, WithoutATagOrTheTitlesIdStayAsTheyAre) {
    EXPECT_EQ(loadNewStyle("just text"), "just text");
    EXPECT_FALSE(wereOldStyle());
}

TEST_F(Contents, AreOldStyleWhenTheyHoldTheTitlesId) {
    EXPECT_EQ(loadNewStyle("<item a></item>" + textTag("IDS_OWN") + "<br/>one<br>two"), "onetwo");
    EXPECT_TRUE(wereOldStyle());
}

TEST_F(Contents, OfTheOldStyleLoseEveryLineBreak) {
    EXPECT_EQ(loadNewStyle("<item a></item>" + textTag("IDS_OWN") + "<br/>1<br>2<br/>3<br>4<br/>5<br>6"), "123456");
    EXPECT_TRUE(wereOldStyle());
}

TEST_F(Contents, AreOldStyleWhenTheyHoldALongerId) {
    loadTip("<title id=\"IDS_WIFI\">x</title>" + contents(textTag("IDS_WIFI_BODY")));
    EXPECT_TRUE(wereOldStyle());
}

TEST_F(Contents, AreOldStyleWhenTheTitleHasNoId) {
    EXPECT_EQ(
        loadTip("<title>Title</title>" + contents("<item a></item><text id=\"IDS_X\">y</text><br/>one")).textContents,
        "one");
    EXPECT_TRUE(wereOldStyle());
}

TEST_F(Contents, AreOldStyleWhenTheyComeBeforeTheTitle) {
    loadTip(contents("text") + "<title id=\"IDS_OWN\">x</title>");
    EXPECT_TRUE(wereOldStyle());
}

TEST_F(Contents, AreOldStyleOnlyInALanguageThatDoesNotKnowTheTitle) {
    const std::string tip = "<title id=\"IDS_WIFI\">Wi-Fi</title>" + contents("<item a></item><text x></text><br/>one");
    loadTip(tip);
    EXPECT_FALSE(wereOldStyle());
    setLanguage("ko_KR.UTF-8");
    loadTip(tip);
    EXPECT_TRUE(wereOldStyle());
}

TEST_F(Contents, OfTheOldStyleWithoutAnItemKeepEverything) {
    EXPECT_EQ(loadContents(textTag("IDS_SYSTEM") + "<br/>one<br>two"), "System text<br/>one<br>two");
    EXPECT_TRUE(wereOldStyle());
}

TEST_F(Contents, OfTheOldStyleWithAnItemThatDoesNotEndKeepEverything) {
    EXPECT_EQ(loadContents("<item a><br/>" + textTag("IDS_SYSTEM")), "<item a><br/>System text");
}

TEST_F(Contents, OfTheOldStyleWithoutATitleLoseTheirItemOnly) {
    EXPECT_EQ(loadContents("a<item x>y</item>b<br/>c<br>d"), "ab<br/>c<br>d");
    EXPECT_TRUE(wereOldStyle());
}

TEST_F(Contents, OfTheOldStyleLoseTheFirstItemAndTheFirstTitleOnly) {
    EXPECT_EQ(loadContents("<item 1></item>" + textTag("IDS_TITLE") + "<br/><item 2></item>" + textTag("IDS_SYSTEM") +
                           "<br>end"),
              "<item 2></item>System textend");
}

TEST_F(Contents, OfTheOldStyleLoseALaterItemThatIsTheSameAsTheFirstNot) {
    EXPECT_EQ(loadContents("<item 1></item>-<item 1></item>"), "-<item 1></item>");
}

TEST_F(Contents, OfTheOldStyleLoseALaterTextThatIsTheSameAsTheTitleNot) {
    const std::string title = textTag("IDS_SYSTEM");
    EXPECT_EQ(loadContents("<item 1></item>" + title + "-" + title), "-System text");
}

TEST_F(Contents, OfTheOldStyleMayHaveTheirTitleBeforeTheItem) {
    EXPECT_EQ(loadContents("<text id=\"IDS_A\">b</text><br/><item x></item>end"), "end");
}

TEST_F(Contents, MayReferToNoFile) {
    EXPECT_EQ(loadContents("href = file: and HREF=FILE:"), "href = file: and HREF=FILE:");
}

TEST_F(Contents, ReferToEveryFileByItsWholePath) {
    EXPECT_EQ(loadNewStyle("<item href=file:a.png></item><br/><item size=1 href=file:b/c.png></item>"),
              "<item href=file:/" + folder() + "a.png></item><br/><item size=1 href=file:/" + folder() +
                  "b/c.png></item>");
}

TEST_F(Contents, KeepTheDoubleSlashOfAWholePath) {
    EXPECT_THAT(loadContents("href=file:a.png"), testing::StartsWith("href=file://"));
}

TEST_F(Contents, ReferToTheFilesOfTheirApplication) {
    addApplication("com.example.clock");
    writeMenus({{tipPath, "com.example.clock"}});
    writeDetail(contents("href=file:a.png"), tipPath, "com.example.clock");
    EXPECT_EQ(load().at(0).textContents, "href=file:/" + resources("com.example.clock").string() + "/a.png");
}

TEST_F(Contents, OfAnotherApplicationAreAttachedWithFilesOfIt) {
    addApplication("com.example.clock");
    writeMenus({{tipPath, "com.example.clock"}});
    writeDetail(contents("ICON") + attach("ICON", "href=file:a.png"), tipPath, "com.example.clock");
    EXPECT_EQ(load().at(0).textContents, "href=file:/" + resources("com.example.clock").string() + "/a.png");
}

TEST_F(Contents, ReferToTheFilesOfTranslationsToo) {
    writeStrings({{"en_US", "IDS_PICTURE", "<item href=file:a.png></item>"}});
    EXPECT_EQ(loadContents(textTag("IDS_PICTURE")), "<item href=file:/" + folder() + "a.png></item>");
}

TEST_F(Contents, StayUntouchedWhenNothingIsLeftOfThem) {
    const std::string markup = "<item href=file:a.png></item>" + textTag("IDS_SYSTEM") + "<br/>";
    EXPECT_EQ(loadContents(markup), markup);
    EXPECT_TRUE(wereOldStyle());
}

TEST_F(Contents, MayBeEmpty) {
    EXPECT_EQ(loadContents(""), "");
}

TEST_F(Contents, OfALaterElementReplaceTheEarlierOnes) {
    EXPECT_EQ(loadTip(contents("one") + contents("two")).textContents, "two");
}

TEST_F(Contents, TakeAnAttachmentInTheirPlaceholder) {
    EXPECT_EQ(loadTip(contents("before ICON after") + attach("ICON", "<item href=file:a.png></item>")).textContents,
              "before <item href=file:/" + folder() + "a.png></item> after");
}

TEST_F(Contents, TakeAnAttachmentInTheFirstPlaceholderOnly) {
    EXPECT_EQ(loadTip(contents("ICON ICON") + attach("ICON", "x")).textContents, "x ICON");
}

TEST_F(Contents, TakeSeveralAttachmentsInTheirOrder) {
    EXPECT_EQ(loadTip(contents("A B") + attach("A", "B") + attach("B", "b")).textContents, "b B");
}

TEST_F(Contents, TakeAnAttachmentAsItIs) {
    EXPECT_EQ(loadTip(contents("A") + attach("A", textTag("IDS_SYSTEM") + "A")).textContents,
              textTag("IDS_SYSTEM") + "A");
}

TEST_F(Contents, IgnoreAnAttachmentWithoutAPlaceholder) {
    EXPECT_EQ(loadTip(contents("text") + attach("ICON", "x")).textContents, "text");
}

TEST_F(Contents, IgnoreAnAttachmentWithoutAnId) {
    EXPECT_EQ(loadTip(contents("text") + "<attach>x</attach>").textContents, "text");
}

TEST_F(Contents, TakeAnAttachmentOfAnEmptyIdInFront) {
    EXPECT_EQ(loadTip(contents("text") + attach("", "x")).textContents, "xtext");
}

TEST_F(Contents, TakeAnEmptyAttachment) {
    EXPECT_EQ(loadTip(contents("a ICON b") + "<attach id=\"ICON\"/>").textContents, "a  b");
}

TEST_F(Contents, LoseAnAttachmentThatComesBeforeThem) {
    EXPECT_EQ(loadTip(attach("No", "x") + contents("No text")).textContents, "No text");
}

TEST_F(Contents, OfATipWithoutAnyAreWhereAnAttachmentGoes) {
    EXPECT_EQ(loadTip(attach("Contents", "x")).textContents, "No x");
}

TEST_F(Contents, AreCachedWithTheirAttachments) {
    loadTip(contents("before ICON") + attach("ICON", "x"));
    EXPECT_EQ(preference("contents_tip.xml_textContents"), "before x");
}

TEST_F(Contents, OfTheOldStyleLoseTheirTitleOnlyBehindTheItem) {
    EXPECT_EQ(loadContents("<item><text a></text></item>one<br/>two"), "one<br/>two");
}

TEST_F(Contents, OfTheOldStyleLoseLineBreaksThatTheOthersLeave) {
    EXPECT_EQ(loadContents("<item></item><text a></text>one<b<br/>r>two"), "onetwo");
}
