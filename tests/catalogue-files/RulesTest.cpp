#include "Rules.h"

#include "support/TemporaryFolder.h"

#include <gmock/gmock.h>

namespace catalogue {
namespace {

using testing::ElementsAre;
using testing::IsEmpty;

const std::vector<std::string> languages = {"en_US", "ko_KR"};

std::optional<std::string> clockOnly(const std::string&, const std::string& id) {
    return id == "IDS_CLOCK" ? std::optional<std::string>("Clock") : std::nullopt;
}

/// A tip that keeps every rule; each test breaks one.
Tip goodTip() {
    Tip tip;
    tip.path = "contents/faces.xml";
    tip.appid = "com.ravella.clock";
    tip.state = "Global";
    tip.line = 4;
    tip.detail.file = "faces.xml";
    tip.detail.titleId = {"IDS_HEADER", 6};
    tip.detail.appNameId = {"IDS_CLOCK", 7};
    tip.detail.contents = {"<text id=\"IDS_BODY\"></text>\n<br/><a href=app><text id=\"IDS_OPEN\"></text></a>", 8};
    tip.strings = {"faces-string.xml",
                   {{"en", "IDS_HEADER", "Faces", 4},
                    {"en", "IDS_BODY", "Touch and <b>hold</b>.", 9},
                    {"en", "IDS_OPEN", "Open", 14},
                    {"ko", "IDS_HEADER", "시계 화면", 19},
                    {"ko_KR", "IDS_BODY", "길게 누르세요.", 24},
                    {"ko", "IDS_OPEN", "열기", 29}}};
    return tip;
}

TEST(Rules, FindNothingWrongWithAGoodTip) {
    const Tip tip = goodTip();
    EXPECT_THAT(contentsAreWellWritten(tip), IsEmpty());
    EXPECT_THAT(idsAreTranslated(tip, languages, clockOnly), IsEmpty());
    EXPECT_THAT(translationsHaveLettersOfTheirLanguage(tip), IsEmpty());
    EXPECT_THAT(translationsFitTheirPlace(tip, languages, clockOnly), IsEmpty());
    EXPECT_THAT(filesExist(tip), IsEmpty());
    EXPECT_THAT(pathsAreUnique({tip}), IsEmpty());
    EXPECT_THAT(stringsAgree({tip, tip}), IsEmpty());
    EXPECT_THAT(regionsAreNotTooFull({tip}), IsEmpty());
}

TEST(Rules, RefuseContentsThatHoldTheTitlesId) {
    Tip tip = goodTip();
    tip.detail.titleId.text = "IDS_BO";
    EXPECT_THAT(contentsAreWellWritten(tip), ElementsAre("faces.xml:8: the contents hold the title's id \"IDS_BO\" and "
                                                         "would be cut as contents of the old form"));
}

TEST(Rules, RefuseATitleWithoutAnId) {
    Tip tip = goodTip();
    tip.detail.titleId.text = "";
    EXPECT_THAT(contentsAreWellWritten(tip), ElementsAre("faces.xml:8: the contents hold the title's id \"\" and would "
                                                         "be cut as contents of the old form"));
}

TEST(Rules, SayWhereContentsAreBadlyWritten) {
    Tip tip = goodTip();
    tip.detail.contents.text = "<text id=\"IDS_BODY\"></text>";
    EXPECT_THAT(contentsAreWellWritten(tip), ElementsAre("faces.xml:8: no link <a href=app> opens the application"));
}

TEST(Rules, RefuseAnIdWithoutATextInALanguage) {
    Tip tip = goodTip();
    tip.strings.strings.pop_back();
    EXPECT_THAT(idsAreTranslated(tip, languages, clockOnly), ElementsAre("faces.xml:8: IDS_OPEN has no text in ko_KR"));
}

TEST(Rules, RefuseATextThatNobodyUses) {
    Tip tip = goodTip();
    tip.strings.strings.push_back({"en", "IDS_OLD", "Old", 34});
    EXPECT_THAT(idsAreTranslated(tip, languages, clockOnly), ElementsAre("faces-string.xml:34: nobody uses IDS_OLD"));
}

TEST(Rules, RefuseATextInALanguageThatTheDeviceDoesNotHave) {
    Tip tip = goodTip();
    tip.strings.strings.push_back({"en_GB", "IDS_OPEN", "Open", 34});
    EXPECT_THAT(idsAreTranslated(tip, languages, clockOnly),
                ElementsAre("faces-string.xml:34: the device has no language en_GB"));
}

TEST(Rules, RefuseATranslationWithoutALetterOfItsLanguage) {
    Tip tip = goodTip();
    tip.strings.strings = {
        {"ar", "IDS_A", "Open", 4},      {"hi", "IDS_A", "Open", 9},        {"ko", "IDS_A", "Open", 14},
        {"ru", "IDS_A", "Open", 19},     {"zh_CN", "IDS_A", "Open", 24},    {"de", "IDS_A", "Open", 29},
        {"ar", "IDS_B", "Wi-Fi و", 34},  {"hi", "IDS_B", "Wi-Fi का", 39},   {"ko", "IDS_B", "Wi-Fi로", 44},
        {"ru", "IDS_B", "по Wi-Fi", 49}, {"zh_CN", "IDS_B", "Wi-Fi 上", 54}};
    EXPECT_THAT(translationsHaveLettersOfTheirLanguage(tip),
                ElementsAre("faces-string.xml:4: IDS_A is not written in ar",
                            "faces-string.xml:9: IDS_A is not written in hi",
                            "faces-string.xml:14: IDS_A is not written in ko",
                            "faces-string.xml:19: IDS_A is not written in ru",
                            "faces-string.xml:24: IDS_A is not written in zh_CN"));
}

TEST(Rules, RefuseATitleThatIsMarkup) {
    Tip tip = goodTip();
    tip.strings.strings[0].value = "Faces & hands";
    EXPECT_THAT(translationsFitTheirPlace(tip, languages, clockOnly),
                ElementsAre("faces.xml:6: IDS_HEADER is no plain line in en_US"));
}

TEST(Rules, RefuseATranslationThatLeavesATagOpen) {
    Tip tip = goodTip();
    tip.strings.strings[4].value = "<b>길게 누르세요.";
    EXPECT_THAT(translationsFitTheirPlace(tip, languages, clockOnly),
                ElementsAre("faces.xml:8: <b> is not closed in ko_KR"));
}

TEST(Rules, RefuseATranslationThatLosesAnAttachment) {
    Tip tip = goodTip();
    tip.detail.attachments = {{"PICTURE", {"<item href=file:contents/a.png></item>", 9}}};
    tip.strings.strings[1].value = "Tap PICTURE.";
    EXPECT_THAT(translationsFitTheirPlace(tip, languages, clockOnly),
                ElementsAre("faces.xml:9: PICTURE does not stand once in the contents in ko_KR"));
}

TEST(Rules, RefuseAnAttachmentThatLeavesATagOpen) {
    Tip tip = goodTip();
    tip.detail.attachments = {{"PICTURE", {"<item href=file:contents/a.png>", 9}}};
    tip.strings.strings[1].value = "Tap PICTURE.";
    tip.strings.strings[4].value = "PICTURE 누르세요.";
    EXPECT_THAT(translationsFitTheirPlace(tip, languages, clockOnly), ElementsAre("faces.xml:9: <item> is not closed"));
}

TEST(Rules, RefuseAPictureThatIsNotThere) {
    const support::TemporaryFolder folder;
    support::writeFile(folder.path() / "contents/there.png", "");
    Tip tip = goodTip();
    tip.sharedResources = folder.path();
    tip.detail.image = {"contents/missing.png", 8};
    tip.detail.attachments = {{"A", {"<item href=file:contents/there.png></item>", 9}},
                              {"B", {"<item href=file:contents/lost.png></item>", 10}}};
    EXPECT_THAT(filesExist(tip),
                ElementsAre("faces.xml:8: no file contents/missing.png", "faces.xml:10: no file contents/lost.png"));
}

TEST(Rules, RefuseTwoTipsThatTheCacheCannotTellApart) {
    Tip first = goodTip();
    first.path = "contents/clock/faces.xml";
    Tip second = goodTip();
    second.path = "contents/clock_faces.xml";
    second.line = 9;
    EXPECT_THAT(pathsAreUnique({first, second}),
                ElementsAre("kest_menu.xml:9: contents/clock_faces.xml is kept as contents/clock/faces.xml is"));
}

TEST(Rules, RefuseAnIdWithTwoMeanings) {
    Tip other = goodTip();
    other.strings.file = "other-string.xml";
    other.strings.strings[2].value = "Open it";
    EXPECT_THAT(stringsAgree({goodTip(), other}),
                ElementsAre("other-string.xml:14: IDS_OPEN has another text in en before"));
}

TEST(Rules, RefuseASixteenthTipInARegion) {
    std::vector<Tip> tips(15, goodTip());
    tips.resize(20);
    EXPECT_THAT(regionsAreNotTooFull(tips), IsEmpty());
    tips.push_back(goodTip());
    EXPECT_THAT(regionsAreNotTooFull(tips), ElementsAre("kest_menu.xml: 16 tips in Global, at most 15 fit"));
}

}  // namespace
}  // namespace catalogue
