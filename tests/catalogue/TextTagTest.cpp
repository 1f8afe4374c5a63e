#include "CatalogueTest.h"

using namespace manager_log;
using kest_files::textTag;
using testing::Contains;

class TextTag : public CatalogueTest {
protected:
    /// Contents that are one tag of an id with that text.
    std::string loadValue(const std::string& value) {
        writeStrings({{"en_US", "IDS_VALUE", value}});
        return loadContents(textTag("IDS_VALUE"));
    }
    bool sawFaultyTag() const {
        return testing::Value(log(), Contains(info("__translateContents", "xml contents error: text id string part")));
    }
    const std::string lineBreak = "<font_size=16><br/></>";
};

TEST_F(TextTag, BecomesItsTranslation) {
    EXPECT_EQ(loadContents("a " + textTag("IDS_SYSTEM") + " b " + textTag("IDS_OWN") + " c"),
              "a System text b Own text c");
    EXPECT_FALSE(sawFaultyTag());
}

TEST_F(TextTag, BecomesItsIdWhenNothingKnowsIt) {
    EXPECT_EQ(loadContents("<text id=\"IDS_A\">Hi</text>"), "IDS_A");
    EXPECT_FALSE(sawFaultyTag());
}

TEST_F(TextTag, IsReplacedEverywhereAtOnce) {
    EXPECT_EQ(loadContents(textTag("IDS_SYSTEM") + "-" + textTag("IDS_SYSTEM")), "System text-System text");
}

TEST_F(TextTag, MayDifferInItsFallbackText) {
    EXPECT_EQ(loadContents("<text id=\"IDS_SYSTEM\">a</text>-<text id=\"IDS_SYSTEM\">b</text>"),
              "System text-System text");
}

TEST_F(TextTag, MayHaveOtherAttributesBeforeItsId) {
    EXPECT_EQ(loadContents("<text class=\"x\" id=\"IDS_SYSTEM\">a</text>"), "System text");
}

TEST_F(TextTag, HasAllForItsIdThatStandsBeforeTheFirstQuoteAtAnEnd) {
    EXPECT_EQ(loadContents("<text id=\"IDS_SYSTEM\" class=\"x\">y</text>"), "IDS_SYSTEM\" class=\"x");
    EXPECT_EQ(loadContents("<text xid=\"IDS_SYSTEM\">y</text>"), "System text");
    EXPECT_FALSE(sawFaultyTag());
}

TEST_F(TextTag, MayBeginInATranslation) {
    for (std::size_t length = 1; length <= sizeof("<text") - 1; ++length) {
        writeStrings({{"en", "IDS_A", std::string("<text").substr(0, length)}});
        const std::string rest = std::string("<text").substr(length) + " id=\"IDS_SYSTEM\">x</text>";
        EXPECT_EQ(loadContents(textTag("IDS_A") + rest), "System text") << length;
    }
}

TEST_F(TextTag, MayEndInATranslation) {
    for (std::size_t length = 1; length < sizeof("<text") - 1; ++length) {
        writeStrings({{"en", "IDS_A", std::string("<text").substr(length) + " id=\"IDS_SYSTEM\">x</text>"}});
        EXPECT_EQ(loadContents("before " + std::string("<text").substr(0, length) + textTag("IDS_A") + " after"),
                  "before System text after")
            << length;
    }
}

TEST_F(TextTag, WithABlankAfterItsIdIsFaultyAndAllThatIsLeft) {
    EXPECT_EQ(loadContents("before <text id=\"IDS_A\" >Hi</text> after"), "Hi");
    EXPECT_TRUE(sawFaultyTag());
}

TEST_F(TextTag, WithoutAnIdIsFaulty) {
    EXPECT_EQ(loadContents("before <text>Hi</text> after"), "Hi");
    EXPECT_TRUE(sawFaultyTag());
}

TEST_F(TextTag, WithAnEmptyIdIsFaulty) {
    EXPECT_EQ(loadContents("before <text id=\"\">Hi</text> after"), "Hi");
    EXPECT_TRUE(sawFaultyTag());
}

TEST_F(TextTag, ThatIsFaultyDropsWhatWasTranslatedBefore) {
    EXPECT_EQ(loadContents(textTag("IDS_SYSTEM") + "<text id='IDS_A'>Hi</text>"), "Hi");
    EXPECT_TRUE(sawFaultyTag());
}

TEST_F(TextTag, ThatIsFaultyAndEmptyLeavesTheElementsOwnText) {
    EXPECT_EQ(loadContents("before <text></text> after"), "before <text></text> after");
    EXPECT_TRUE(sawFaultyTag());
}

TEST_F(TextTag, ThatIsFaultyLeavesWhatStandsBeforeTheNextTag) {
    EXPECT_EQ(loadContents("before <text id=\"IDS_A\" >See <b>this</b></text> after"), "See ");
    EXPECT_EQ(loadContents("before <text a>b>c</text> after"), "b>c");
}

TEST_F(TextTag, ThatDoesNotEndIsNone) {
    EXPECT_EQ(loadContents("<text id=\"IDS_SYSTEM\">a"), "<text id=\"IDS_SYSTEM\">a");
    EXPECT_FALSE(sawFaultyTag());
}

TEST_F(TextTag, BeginsWhereTheWordBegins) {
    EXPECT_EQ(loadContents("<textual id=\"IDS_SYSTEM\">a</text>"), "System text");
}

TEST_F(TextTag, EndsAtTheFirstEnd) {
    EXPECT_EQ(loadContents("<text id=\"IDS_SYSTEM\"><text id=\"IDS_OWN\">a</text></text>"), "System text</text>");
}

TEST_F(TextTag, OfTheApplicationsIsFoundAfterOneOfTheSystemsInATipOfTheApplicationsDomain) {
    // A text that the domain does not have leaves it bound to the system's folder.
    const std::string contents = kest_files::contents(textTag("IDS_SYSTEM") + "-" + textTag("IDS_OWN"));
    EXPECT_EQ(loadTip("<textdomain>kest</textdomain>" + contents).textContents, "System text-Own text");
}

TEST_F(TextTag, HasItsLineBreaksMadeSmall) {
    EXPECT_EQ(loadValue("a\nb"), "a" + lineBreak + "b");
    EXPECT_EQ(loadValue("a\\nb"), "a" + lineBreak + "b");
    EXPECT_EQ(loadValue("\n\\n\n"), lineBreak + lineBreak + lineBreak);
    EXPECT_EQ(loadValue("a\\nb\\nc"), "a" + lineBreak + "b" + lineBreak + "c");
}

TEST_F(TextTag, HasItsAmpersandsEscaped) {
    EXPECT_EQ(loadValue("A & B"), "A &amp; B");
    EXPECT_EQ(loadValue("A &amp; B"), "A &amp;amp; B");
    EXPECT_EQ(loadValue("A & B & C"), "A &amp; B &amp; C");
}

TEST_F(TextTag, KeepsTheMarkupOfItsTranslation) {
    EXPECT_EQ(loadValue("<b>bold</b> <br/>"), "<b>bold</b> <br/>");
}

TEST_F(TextTag, InATranslationIsTranslatedInTurn) {
    EXPECT_EQ(loadValue("see " + textTag("IDS_OWN")), "see Own text");
}

TEST_F(TextTag, MayComeToBeWhereATranslationMeetsTheText) {
    writeStrings({{"en_US", "IDS_HEAD", "<te"}});
    EXPECT_EQ(loadContents(textTag("IDS_HEAD") + "xt id=\"IDS_OWN\">a</text>"), "Own text");
}

TEST_F(TextTag, OutsideItsTranslationsTextStaysAsItIs) {
    EXPECT_EQ(loadContents("A & B\\n\n" + textTag("IDS_SYSTEM")), "A & B\\n\nSystem text");
}

TEST_F(TextTag, ThatBringsItselfBackEndsSometime) {
    EXPECT_EQ(loadValue(textTag("IDS_VALUE")), textTag("IDS_VALUE"));
    EXPECT_TRUE(sawFaultyTag());
}
