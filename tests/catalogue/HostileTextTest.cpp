#include "HostileTest.h"
#include "ProcessorClock.h"

using namespace manager_log;
using kest_files::contents;
using kest_files::textTag;
using testing::Contains;

/// Contents and translations that would keep the translator busy for ever.
class HostileText : public HostileTest {
protected:
    static constexpr std::size_t megabyte = 1024 * 1024;

    bool wasCutShort() const {
        return testing::Value(log(), Contains(info("__translateContents", "xml contents error: text id string part")));
    }
    /// Made absolute, they are as long as the longest file.
    std::size_t mostReferences() const { return 16 * megabyte / ("href=file:/" + resources().string() + "/").size(); }
    static std::string numbered(std::size_t number) {
        std::string digits = std::to_string(number);
        return textTag("IDS_" + std::string(7 - digits.size(), '0') + digits);
    }
    /// What tags(count) becomes when nothing knows the ids.
    static std::string translated(std::size_t count) {
        std::string all;
        for (std::size_t i = 0; i < count; ++i)
            all += numbered(i).substr(sizeof("<text id=\"") - 1, sizeof("IDS_0000000") - 1);
        return all;
    }
    static std::string tags(std::size_t count) {
        std::string all;
        for (std::size_t i = 0; i < count; ++i)
            all += numbered(i);
        return all;
    }
};

TEST_F(HostileText, TranslationMayBringItsOwnTagBack) {
    writeStrings({{"en", "IDS_A", textTag("IDS_A")}});
    EXPECT_EQ(loadContents(textTag("IDS_A")), textTag("IDS_A"));
    EXPECT_TRUE(wasCutShort());
}

TEST_F(HostileText, TranslationMayBringItsOwnTagBackAndGrow) {
    writeStrings({{"en", "IDS_A", textTag("IDS_A") + "x"}});
    const std::string text = loadContents(textTag("IDS_A"));
    EXPECT_EQ(text, textTag("IDS_A") + std::string(10000, 'x')) << "after 10,000 replacements it stays as it stands";
    EXPECT_TRUE(wasCutShort());
}

TEST_F(HostileText, TranslationsMayBringEachOtherBack) {
    writeStrings({{"en", "IDS_A", textTag("IDS_B")}, {"en", "IDS_B", textTag("IDS_A")}});
    EXPECT_EQ(loadContents(textTag("IDS_A")), textTag("IDS_A"));
    EXPECT_TRUE(wasCutShort());
}

TEST_F(HostileText, TranslationMayDoubleItself) {
    writeStrings(
        {{"en", "IDS_A", textTag("IDS_B") + textTag("IDS_B")}, {"en", "IDS_B", textTag("IDS_A") + textTag("IDS_A")}});
    const std::string text = loadContents(textTag("IDS_A"));
    EXPECT_LE(text.size(), megabyte);
    EXPECT_GT(text.size(), megabyte / 4);
    EXPECT_TRUE(wasCutShort());
}

TEST_F(HostileText, LongTranslationMayBringItselfBack) {
    const std::string tag = "<text id=\"IDS_A\">" + std::string(900000, 'x') + "</text>";
    writeStrings({{"en", "IDS_A", tag}});
    EXPECT_EQ(loadContents(textTag("IDS_A")), tag);
    EXPECT_TRUE(wasCutShort());
}

TEST_F(HostileText, LongTranslationsMayBringEachOtherBack) {
    const auto tag = [](const std::string& id) {
        return "<text id=\"" + id + "\">" + std::string(900000, 'x') + "</text>";
    };
    writeStrings({{"en", "IDS_A", tag("IDS_B")}, {"en", "IDS_B", tag("IDS_A")}});
    EXPECT_THAT(loadContents(textTag("IDS_A")), testing::AnyOf(tag("IDS_A"), tag("IDS_B")));
    EXPECT_TRUE(wasCutShort());
}

TEST_F(HostileText, LongTranslationMayBeUsedOften) {
    writeStrings({{"en", "IDS_A", std::string(megabyte - 100, 'x')}});
    const std::string text = repeated(textTag("IDS_A"), 25000);
    EXPECT_EQ(loadContents(text), text) << "it would become 25 gigabytes";
    EXPECT_TRUE(wasCutShort());
}

TEST_F(HostileText, TranslationMayBeAllLineBreaksOrAmpersands) {
    for (const char* piece : {"\n", "\\n", "&"}) {
        writeStrings({{"en", "IDS_A", repeated(piece, 9000000 / std::string(piece).size())}});
        EXPECT_EQ(loadContents(textTag("IDS_A")), textTag("IDS_A"));
        EXPECT_TRUE(wasCutShort());
    }
}

TEST_F(HostileText, TranslationOfAMegabyteIsPutIn) {
    const std::string value(megabyte - 2, 'x');
    writeStrings({{"en", "IDS_A", value}});
    EXPECT_EQ(loadContents("a" + textTag("IDS_A") + "b"), "a" + value + "b");
    EXPECT_FALSE(wasCutShort());
}

TEST_F(HostileText, ContentsOfMoreThanAMegabyteStayAsTheyAre) {
    const std::string text = std::string(megabyte, 'x') + textTag("IDS_OWN");
    EXPECT_EQ(loadContents(text), text);
    EXPECT_TRUE(wasCutShort());
}

TEST_F(HostileText, ContentsMayHaveTenThousandDifferentTags) {
    EXPECT_TRUE(loadContents(tags(10000)) == translated(10000));
    EXPECT_FALSE(wasCutShort());
}

TEST_F(HostileText, ContentsMayHaveMoreThanTenThousandDifferentTags) {
    EXPECT_TRUE(loadContents(tags(24000)) == translated(10000) + tags(24000).substr(tags(10000).size()));
    EXPECT_TRUE(wasCutShort());
}

TEST_F(HostileText, ContentsMayHaveThousandsOfEqualTags) {
    const std::string text = loadContents(repeated("<text id=\"IDS_OWN\">a</text>", 35000));
    EXPECT_EQ(text, repeated("Own text", 35000));
    EXPECT_FALSE(wasCutShort());
}

TEST_F(HostileText, ContentsMayHaveAMillionTags) {
    EXPECT_EQ(loadContents(repeated("<text></text>", 1000000)), "]>") << "the parser drops a text of ten megabytes";
    const std::string half = repeated("<text></text>", 500000);
    EXPECT_TRUE(loadTip(contents(half) + contents(half)).textContents == half) << "the first is a faulty tag";
    EXPECT_TRUE(wasCutShort());
}

TEST_F(HostileText, ContentsHaveTheirReplacementsEach) {
    EXPECT_TRUE(loadTip(contents(tags(6000)) + contents(tags(7000))).textContents == translated(7000));
    EXPECT_FALSE(wasCutShort());
}

TEST_F(HostileText, ContentsMayBeFullOfBeginnings) {
    const std::string rest = repeated("<", 600000);
    const std::string text = loadContents(tags(10000) + rest);
    EXPECT_TRUE(text == translated(10000) + rest);
    EXPECT_FALSE(wasCutShort());
}

TEST_F(HostileText, ContentsMayBeFullOfTagsThatDoNotEnd) {
    const std::string text = repeated("<text id=\"IDS_OWN\">", 50000);
    EXPECT_EQ(loadContents(text), text);
    EXPECT_EQ(loadContents(text + "</text>"), "Own text");
}

TEST_F(HostileText, ContentsMayBeFullOfEnds) {
    const std::string text = repeated("</text>", 100000);
    EXPECT_EQ(loadContents(text + tags(5000)).size(), text.size() + 5000 * 11);
}

TEST_F(HostileText, ContentsMayReferToHundredsOfThousandsOfFiles) {
    const std::string converted = "href=file:/" + resources().string() + "/";
    const std::string text = loadContents(repeated("href=file:", mostReferences()));
    ASSERT_EQ(text.size(), converted.size() * mostReferences());
    for (std::size_t at = 0; at < text.size(); at += converted.size())
        ASSERT_EQ(text.compare(at, converted.size(), converted), 0) << at;
    EXPECT_THAT(warnings(), testing::IsEmpty());
}

TEST_F(HostileText, ContentsMayReferToMoreFilesThanAnybodyReads) {
    const std::string text = repeated("href=file:", mostReferences() + 1);
    EXPECT_EQ(loadContents(text), text);
    EXPECT_THAT(warnings(),
                Contains(kest_log::warning("KestTextGrowth.cpp", "withAbsolutePaths",
                                           "too many references to files below " + resources().string() + "/")));
}

TEST_F(HostileText, AttachmentsMayBeFullOfReferences) {
    const std::string text = repeated("href=file:", mostReferences() + 1);
    EXPECT_EQ(loadTip(contents("A") + "<attach id=\"A\">" + text + "</attach>").textContents, text);
}

TEST_F(HostileText, AttachmentsMayMakeTheContentsLongerThanAnyFile) {
    const std::string piece = "A" + std::string(9 * megabyte, 'x');
    EXPECT_EQ(
        loadTip(contents("A") + "<attach id=\"A\">" + piece + "</attach>" + "<attach id=\"A\">" + "AA" + "</attach>")
            .textContents,
        "A" + piece);
    writeStrings({{"en", "IDS_LONG", piece}});
    EXPECT_EQ(loadTip("<title id=\"IDS_LONG\">x</title>" + contents("A") + repeated("<attach id=\"A\">AA</attach>", 3))
                  .textContents,
              "AAAA");
}

TEST_F(HostileText, TitlesIdMayBeNearlyWhatTheContentsAreFullOf) {
    const std::string id = std::string(500000, 'a') + "b";
    writeStrings({{"en", id, "Title"}});
    const std::string text(5000000, 'a');
    EXPECT_EQ(loadTip("<title id=\"" + id + "\">x</title>" + contents(text)).textContents, text);
}

TEST_F(HostileText, AttachmentsIdMayBeNearlyWhatTheContentsAreFullOf) {
    const std::string text(5000000, 'a');
    EXPECT_EQ(loadTip(contents(text) + "<attach id=\"" + std::string(500000, 'a') + "b\">x</attach>").textContents,
              text);
}

TEST_F(HostileText, ALongTranslationMayBeAskedForInEveryText) {
    const processor_clock::Standing clock;
    writeStrings({{"en", "IDS_A", std::string(9900000, 'x')}});
    EXPECT_EQ(loadTip(repeated("<contents>&lt;text id=\"IDS_A\"&gt;&lt;/text&gt;</contents>", 100000)).textContents,
              "<text id=\"IDS_A\"></text>");
    EXPECT_TRUE(wasCutShort());
    EXPECT_EQ(loadTip(repeated("<title id=\"IDS_A\">x</title>", 100000)).menuTitle, "x");
}

TEST_F(HostileText, ManyContentsDoNotTakeLongerThanOneThatBringsItselfBack) {
    writeStrings({{"en", "IDS_AGAIN", textTag("IDS_AGAIN") + std::string(2000, 'x')}});
    loadTip(repeated(contents(textTag("IDS_AGAIN")), 5000));
    EXPECT_TRUE(result());
}

TEST_F(HostileText, ADomainMayHaveAnyName) {
    EXPECT_EQ(
        loadTip("<textdomain>" + std::string(9000000, 'd') + "</textdomain><title id=\"IDS_NOBODY_KNOWS\">T</title>")
            .menuTitle,
        "T");
}

TEST_F(HostileText, ADomainDoesNotLeadOutOfItsFolder) {
    const std::string title = "<title id=\"IDS_TIPS\">untranslated</title>";
    ASSERT_NE(loadTip("<textdomain>tips</textdomain>" + title).menuTitle, "untranslated");
    EXPECT_EQ(loadTip("<textdomain>../LC_MESSAGES/tips</textdomain>" + title).menuTitle, "untranslated");
}

TEST_F(HostileText, ADomainHasTwoHundredBytesAtMost) {
    const auto isBound = [this](std::size_t length) {
        const std::string domain(length, 'd');
        loadTip("<textdomain>" + domain + "</textdomain><title id=\"IDS_OWN\">T</title>");
        const auto& bound = kest_texts::bindings();
        return std::any_of(bound.begin(), bound.end(), [&](const auto& binding) { return binding.first == domain; });
    };
    EXPECT_TRUE(isBound(200));
    EXPECT_FALSE(isBound(201));
}

TEST_F(HostileText, OfOneTipDoesNotSpoilAnother) {
    const std::string tag = "<text id=\"IDS_A\">" + std::string(900000, 'x') + "</text>";
    writeStrings({{"en", "IDS_A", tag}});
    writeMenus({{}, {"contents/other.xml"}});
    writeDetail("<title id=\"IDS_OWN\">x</title>" + contents(textTag("IDS_A")));
    writeDetail("<title id=\"IDS_OWN\">x</title>" + contents(textTag("IDS_OWN")), "contents/other.xml");
    // More loads than one load's work is enough for.
    for (int time = 0; time < 6; ++time) {
        const auto records = load();
        EXPECT_EQ(records.at(1).menuTitle, "Own text");
        EXPECT_EQ(records.at(1).textContents, "Own text");
    }
}

TEST_F(HostileText, DomainsMayBeThousandsOfWhichTheFirstOnesCount) {
    std::string domains;
    for (int i = 0; i < 300; ++i)
        domains += "<textdomain>d" + std::to_string(i) + "</textdomain><title id=\"x\">x</title>";
    const std::string last = "<textdomain>tips</textdomain><title id=\"IDS_TIPS\">untranslated</title>";
    EXPECT_EQ(loadTip(domains + last).menuTitle, "untranslated");
}

TEST_F(HostileText, AttachmentsMayBeAThousand) {
    EXPECT_EQ(loadTip(contents("A" + std::string(100000, 'x')) + repeated("<attach id=\"A\">AA</attach>", 1000))
                  .textContents.size(),
              101001U);
    EXPECT_THAT(warnings(), testing::IsEmpty());
}

TEST_F(HostileText, AttachmentsMayBeMoreThanAnybodyWaitsFor) {
    loadTip(contents("A" + std::string(4000000, 'x')) + repeated("<attach id=\"A\">AA</attach>", 5000));
    EXPECT_THAT(warnings(),
                Contains(kest_log::warning("KestTextGrowth.cpp", "attach", "too much to attach: " + tipPath)));
}

TEST_F(HostileText, AttachmentsMayBeNearlyWhatTheContentsAreFullOf) {
    loadTip(contents(std::string(8000000, 'a')) + repeated("<attach id=\"aaabaaaa\">x</attach>", 20000));
    EXPECT_THAT(warnings(),
                Contains(kest_log::warning("KestTextGrowth.cpp", "attach", "too much to attach: " + tipPath)));
}
