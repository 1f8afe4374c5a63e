#include "PageTest.h"

namespace {

using test_ui::Rect;

constexpr unsigned int paper = 0xF7F8FA;
constexpr unsigned int iconRed = 0xC80000;
constexpr unsigned int link = 0x0A6577;
constexpr unsigned int linkPressed = 0xC3DEE5;

class InfoArea : public PageTest {
protected:
    void show(const std::string& title, const std::string& text, Kind kind = {}) {
        startPage(kind);
        showInfo(picture(iconRed, 124, 124), title, text);
        test_ui::runFor(1);
    }
    Rect label() const { return test_ui::geometry(label_); }
    Rect entry() const { return test_ui::geometry(entry_); }
};

TEST_F(InfoArea, HasTheTitleAboveTheTextWithinTheMargins) {
    show("Find your way", "One finger.");
    EXPECT_EQ(36, label().x);
    EXPECT_EQ(36, entry().x);
    EXPECT_NEAR(648, label().width, 1);
    EXPECT_NEAR(648, entry().width, 1);
    EXPECT_GE(label().y, 767);
    EXPECT_GE(entry().y, label().y + label().height);
}

TEST_F(InfoArea, IsAPaperWithRoundedUpperCorners) {
    show("Find", "One finger.", {.isDark = true});
    const auto shown = screen().picture();
    for (const int x : {0, 719})
        EXPECT_THAT(shown.pixel(x, 768), LooksLike(0x0E1116)) << x;
    EXPECT_EQ(shown.pixel(60, 768), paper);
}

TEST_F(InfoArea, DrawsTheIconBesideTheTitleInTheMiddle) {
    show("Find", "One finger.");
    const auto shown = screen().picture();
    EXPECT_EQ(62 * 62, shown.count(iconRed, {0, 767, 720, 513}));
    int left = 0;
    while (shown.colours({left, label().y, 1, label().height}) == 1)
        ++left;
    int right = 719;
    while (shown.colours({right, label().y, 1, label().height}) == 1)
        --right;
    EXPECT_EQ(iconRed, shown.pixel(left + 5, label().y + label().height / 2));
    EXPECT_NEAR(719, left + right, 12) << "as much room at both sides";
    EXPECT_EQ(0, shown.count(iconRed, {left + 62, 767, 720, 513}));
}

TEST_F(InfoArea, DrawsTheIconAtTheTitlesRightWhereOneReadsFromRightToLeft) {
    elm_config_mirrored_set(EINA_TRUE);
    show("تنقّل", "إصبع واحد");
    const auto shown = screen().picture();
    EXPECT_EQ(62 * 62, shown.count(iconRed, {360, 767, 360, 513}));
    EXPECT_GT(shown.colours({36, entry().y + 30, 648, 20}), 1);
    EXPECT_EQ(1, shown.colours({36, entry().y, 300, entry().height})) << "the text begins at the right";
}

TEST_F(InfoArea, ShrinksTheIconOnTheSmallScreen) {
    show("Find", "One finger.", {.isLarge = false});
    EXPECT_NEAR(40.5 * 40.5, screen().picture().count(iconRed, {0, 442, 480, 358}), 85);
}

TEST_F(InfoArea, BreaksALongTitleAndALongWordInsteadOfCuttingThem) {
    const std::string word = "Donaudampfschifffahrtsgesellschaftskapitänsmütze";
    show(word + " for you and everybody else", word + word);
    EXPECT_GT(label().height, 180);
    EXPECT_EQ(1, screen().picture().colours({686, 800, 34, 480}));
    EXPECT_EQ(1, screen().picture().colours({0, 800, 34, 480}));
    EXPECT_GE(entry().y, label().y + label().height);
}

TEST_F(InfoArea, ScrollsWhenThereIsMoreToRead) {
    std::string text;
    for (int line = 0; line < 30; ++line)
        text += "Line " + std::to_string(line) + "<br/>";
    show("Find", text);
    int height = 0;
    elm_scroller_region_get(infoScroller_, nullptr, nullptr, nullptr, &height);
    EXPECT_GT(test_ui::geometry(info_).height, height + 1000);
    screen().swipe({360, 1200}, {360, 800}, 0.3);
    test_ui::runFor(3);
    EXPECT_LT(label().y, 700);
}

TEST_F(InfoArea, ShowsAThumbForAMomentWhenItsPageIsDisplayed) {
    std::string text;
    for (int line = 0; line < 30; ++line)
        text += "Line " + std::to_string(line) + "<br/>";
    show("Find", text);
    test_ui::runFor(5);
    const Rect edge{704, 800, 16, 480};
    EXPECT_EQ(1, screen().picture().colours(edge));
    elm_layout_signal_emit(infoScroller_, "show", "");
    test_ui::runFor(0.2);
    EXPECT_GT(screen().picture().colours(edge), 1);
    test_ui::runFor(3);
    EXPECT_EQ(1, screen().picture().colours(edge));
}

TEST_F(InfoArea, HasAFaintLineAboveItWhereThereIsMoreAboveInTheDarkThemeToo) {
    std::string text;
    for (int line = 0; line < 30; ++line)
        text += "Line " + std::to_string(line) + "<br/>";
    show("Find", text, {.isDark = true});
    const auto edge = [&] { return screen().picture().pixel(60, 781); };
    EXPECT_EQ(paper, edge());
    screen().swipe({360, 1200}, {360, 900}, 0.3);
    test_ui::runFor(3);
    EXPECT_NE(paper, edge());
    EXPECT_GT(edge() & 255, 0xC0u);
    EXPECT_EQ(paper, screen().picture().pixel(20, 781)) << "it begins at the margin";
}

class InfoAreaInBothThemes : public InfoArea, public testing::WithParamInterface<bool> {};

TEST_P(InfoAreaInBothThemes, IsLightPaperWithDarkWriting) {
    show("Find", "One finger. <a href=app>Open</a>", {.isDark = GetParam()});
    const auto shown = screen().picture();
    EXPECT_EQ(paper, shown.pixel(10, 1270));
    EXPECT_GT(shown.count(0x000000, label()), 50);
    EXPECT_GT(shown.count(0x14181F, entry()), 50);
    EXPECT_GT(shown.count(link, entry()), 50);
}

INSTANTIATE_TEST_SUITE_P(Theme, InfoAreaInBothThemes, testing::Bool(),
                         [](const auto& test) { return test.param ? "dark" : "light"; });

TEST_F(InfoArea, KeepsItsIconWhenTheThemeChanges) {
    show("Find", "One finger.");
    uxt::applyDeviceTheme(true);
    elm_theme_flush(nullptr);
    test_ui::runFor(1);
    EXPECT_EQ(62 * 62, screen().picture().count(iconRed, {0, 767, 720, 513}));
}

class Link : public InfoArea {
protected:
    Rect place() const { return test_ui::link(entry_, "app"); }
    unsigned int around() { return screen().picture().pixel(place().x + 1, place().y + 3); }
};

TEST_F(Link, IsColouredAndUnderlined) {
    show("Find", "One finger. <a href=app>Open</a> all");
    const auto shown = screen().picture();
    EXPECT_GT(shown.count(link, place()), 200);
    EXPECT_EQ(0, shown.count(link, {36, entry().y, place().x - 36, entry().height}));
    EXPECT_EQ(0, shown.count(link, {place().x + place().width, entry().y, 300, entry().height}));
    bool underlined = false;
    for (int y = place().y; y < place().y + place().height; ++y)
        underlined |= shown.count(link, {place().x + 2, y, place().width - 4, 1}) == place().width - 4;
    EXPECT_TRUE(underlined);
}

TEST_F(Link, ShowsTheFingerThatIsOnItAndIsTappedOnce) {
    show("Find", "One finger.<br/><a href=app>Open the gesture settings and more of them</a>");
    EXPECT_EQ(paper, around());
    screen().press(place().middle());
    test_ui::runFor(0.1);
    EXPECT_EQ(linkPressed, around());
    screen().lift();
    test_ui::runFor(0.1);
    EXPECT_EQ(paper, around());
    EXPECT_EQ(1, links_);
    screen().tap(place().middle());
    test_ui::runFor(0.3);
    EXPECT_EQ(2, links_);
}

TEST_F(Link, DoesNotStayPressedWhenTheFingerDragsTheTextAway) {
    std::string text = "<a href=app>Open</a>";
    for (int line = 0; line < 30; ++line)
        text += "<br/>Line " + std::to_string(line);
    show("Find", text);
    screen().press(place().middle());
    test_ui::runFor(0.05);
    EXPECT_EQ(linkPressed, around());
    evas_object_freeze_events_set(entry_, EINA_TRUE);
    screen().lift();
    evas_object_freeze_events_set(entry_, EINA_FALSE);
    test_ui::runFor(1.2);
    EXPECT_EQ(paper, around());
}

}  // namespace
