#include "KestTipMarkup.h"

#include <gtest/gtest.h>

#include <string>

namespace {

KestContentInfo tip(const std::string& title, const std::string& text = "") {
    KestContentInfo record;
    record.menuTitle = title;
    record.textContents = text;
    record.iconPath = "/opt/usr/apps/com.ravella.clock/shared/res/clock.png";
    return record;
}

}  // namespace

TEST(TipTitle, IsTheIconAndTheTitleInBlack) {
    EXPECT_EQ(KestTipMarkup::title(tip("Set an alarm")),
              "<align=center><item size=62x62 vsize=full "
              "href=file://opt/usr/apps/com.ravella.clock/shared/res/clock.png></item>"
              "  <color=#000000><font_weight='Regular'><font_width='condensed'><font_size=46>"
              "Set an alarm</font_size></font_width></font_weight></color></align>");
}

TEST(TipTitle, TakesTitleAndIconAsTheyStand) {
    KestContentInfo record = tip("Wi-Fi &amp; <b>more</b>");
    record.iconPath = "No icon Path";
    EXPECT_EQ(KestTipMarkup::title(record),
              "<align=center><item size=62x62 vsize=full href=file:/No icon Path></item>"
              "  <color=#000000><font_weight='Regular'><font_width='condensed'><font_size=46>"
              "Wi-Fi &amp; <b>more</b></font_size></font_width></font_weight></color></align>");
}

TEST(TipTitle, MayBeEmpty) {
    KestContentInfo record = tip("");
    record.iconPath = "";
    EXPECT_EQ(KestTipMarkup::title(record),
              "<align=center><item size=62x62 vsize=full href=file:/></item>"
              "  <color=#000000><font_weight='Regular'><font_width='condensed'><font_size=46>"
              "</font_size></font_width></font_weight></color></align>");
}

TEST(TipTitle, OfTenThousandCharactersIsWhole) {
    const std::string title(10000, 'x');
    EXPECT_NE(KestTipMarkup::title(tip(title)).find(">" + title + "</font_size>"), std::string::npos);
}

TEST(TipText, StandsInTheStyleOfATip) {
    EXPECT_EQ(KestTipMarkup::text(tip("", "Open <a href=clock>Clock</a>.")),
              "<font_style='Regular' font_size=36 align=left linegap=10>Open <a href=clock>Clock</a>.</>");
}

TEST(TipText, ThatIsEmptyHasNoMarkupEither) {
    EXPECT_EQ(KestTipMarkup::text(tip("Set an alarm", "")), "");
}

TEST(TipText, OfABlankIsNotEmpty) {
    EXPECT_EQ(KestTipMarkup::text(tip("", " ")), "<font_style='Regular' font_size=36 align=left linegap=10> </>");
}

TEST(TipText, TakesAPercentSignAsItStands) {
    EXPECT_EQ(KestTipMarkup::text(tip("", "100%s %n")),
              "<font_style='Regular' font_size=36 align=left linegap=10>100%s %n</>");
}

TEST(PageNumber, StandsWhereTheTranslationWantsIt) {
    EXPECT_EQ(KestTipMarkup::pageNumber("Tips %d/%d", 3, 11), "Tips 3/11");
    EXPECT_EQ(KestTipMarkup::pageNumber("팁 %d/%d", 15, 15), "팁 15/15");
}

TEST(PageNumber, MayComeSecond) {
    EXPECT_EQ(KestTipMarkup::pageNumber("%2$d 중 %1$d", 3, 11), "11 중 3");
    EXPECT_EQ(KestTipMarkup::pageNumber("%1$d/%2$d", 3, 11), "3/11");
    EXPECT_EQ(KestTipMarkup::pageNumber("%1$d %1$d", 3, 11), "3 3");
}

TEST(PageNumber, NeedsNoCount) {
    EXPECT_EQ(KestTipMarkup::pageNumber("Tip %d", 3, 11), "Tip 3");
    EXPECT_EQ(KestTipMarkup::pageNumber("Tips", 3, 11), "Tips");
    EXPECT_EQ(KestTipMarkup::pageNumber("", 3, 11), "");
}

TEST(PageNumber, MayHaveAPercentSign) {
    EXPECT_EQ(KestTipMarkup::pageNumber("%d%% of %d", 3, 11), "3% of 11");
    EXPECT_EQ(KestTipMarkup::pageNumber("%%d %d", 3, 11), "%d 3");
    EXPECT_EQ(KestTipMarkup::pageNumber("%%", 3, 11), "%");
}

TEST(PageNumber, IsTheTranslationWhereThatAsksForOtherThanNumbers) {
    for (const char* unsafe : {"Tips %s", "Tips %n", "%d %s", "%5$d", "%*d", "%100000000d", "%ld", "%", "Tips %d/%",
                               "%1$s", "%3$d", "% d", "%c%c", "%1", "%1$"})
        EXPECT_EQ(KestTipMarkup::pageNumber(unsafe, 3, 11), unsafe);
}

TEST(PageNumber, IsTheTranslationWhereThatAsksForThreeNumbers) {
    EXPECT_EQ(KestTipMarkup::pageNumber("%d/%d/%d", 3, 11), "%d/%d/%d");
}

TEST(PageNumber, HasAtMost255Bytes) {
    EXPECT_EQ(KestTipMarkup::pageNumber("%d" + std::string(300, 'x'), 3, 11), "3" + std::string(254, 'x'));
    EXPECT_EQ(KestTipMarkup::pageNumber(std::string(300, 'x') + "%s", 3, 11), std::string(255, 'x'));
    EXPECT_EQ(KestTipMarkup::pageNumber(std::string(253, 'x') + "%d%d", 3, 11), std::string(253, 'x') + "31");
}

TEST(PageNumber, OfNoPagesIsWrittenToo) {
    EXPECT_EQ(KestTipMarkup::pageNumber("Tips %d/%d", 1, 0), "Tips 1/0");
}
