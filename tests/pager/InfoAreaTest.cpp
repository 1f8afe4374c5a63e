#include "PagerTest.h"

#include <device/Keys.h>

using testing::Contains;
using testing::HasSubstr;
using testing::IsEmpty;
using testing::Not;

/// What there is to read on a page: the title line and the text.
class InfoArea : public PagerTest {
protected:
    void openTip(const std::string& item) {
        writeTips({item});
        open();
    }
    static kest_log::Line isEmpty(int index) {
        return kest_log::info("KestContentSubView.cpp", "__setText",
                              "contentList[" + std::to_string(index) + "].textContents is empty");
    }
};

TEST_F(InfoArea, ShowsTheTipsIconAndTitle) {
    openTip(tip("a_01.png"));
    EXPECT_EQ(test_ui::text(titleLabel()), titleMarkup(icon(), "Title"));
    EXPECT_EQ(elm_label_line_wrap_get(titleLabel()), ELM_WRAP_MIXED);
}

TEST_F(InfoArea, ShowsTheText) {
    openTip(tip("a_01.png", "Open <a href=app>Clock</a>."));
    EXPECT_EQ(test_ui::text(entry()), textMarkup("Open <a href=app>Clock</a>."));
    EXPECT_EQ(test_ui::plainText(entry()), "Open Clock.");
}

TEST_F(InfoArea, IsToRead) {
    openTip(tip("a_01.png"));
    EXPECT_FALSE(elm_entry_editable_get(entry()));
    EXPECT_FALSE(elm_entry_scrollable_get(entry()));
    EXPECT_TRUE(evas_object_visible_get(entry()));
    EXPECT_TRUE(evas_object_visible_get(info()));
}

TEST_F(InfoArea, IsFilledByItsText) {
    openTip(tip("a_01.png"));
    for (const Evas_Object* object : {entry(), infoLayout()}) {
        double across = 0, down = 0;
        evas_object_size_hint_align_get(object, &across, &down);
        EXPECT_EQ(std::pair(across, down), std::pair(EVAS_HINT_FILL, EVAS_HINT_FILL));
        evas_object_size_hint_weight_get(object, &across, &down);
        EXPECT_EQ(std::pair(across, down), std::pair(EVAS_HINT_EXPAND, EVAS_HINT_EXPAND));
    }
}

TEST_F(InfoArea, ScrollsUpAndDownAsAWhole) {
    openTip(tip("a_01.png"));
    EXPECT_STREQ(elm_object_style_get(info()), "effect");
    Eina_Bool horizontal = EINA_TRUE, vertical = EINA_FALSE;
    elm_scroller_bounce_get(info(), &horizontal, &vertical);
    EXPECT_FALSE(horizontal);
    EXPECT_TRUE(vertical);
    Elm_Scroller_Policy horizontalBar{}, verticalBar{};
    elm_scroller_policy_get(info(), &horizontalBar, &verticalBar);
    EXPECT_EQ(horizontalBar, ELM_SCROLLER_POLICY_OFF);
    EXPECT_EQ(verticalBar, ELM_SCROLLER_POLICY_AUTO);
}

TEST_F(InfoArea, IsAsWideAsThePageAndAsHighAsItsText) {
    std::string text;
    for (int line = 0; line < 40; ++line)
        text += "A line of text.<br/>";
    openTip(tip("a_01.png", text));
    test_ui::runFor(0.1);
    const test_ui::Rect area = test_ui::geometry(info());
    const test_ui::Rect whole = test_ui::geometry(infoLayout());
    EXPECT_EQ(whole.width, area.width);
    EXPECT_GT(whole.height, 40 * 36);
    EXPECT_GE(whole.height, test_ui::geometry(entry()).height + test_ui::geometry(titleLabel()).height);
}

TEST_F(InfoArea, WithoutATextIsEmptyAndToldOf) {
    openTip("<title>Title</title><image>x</image><contents></contents>");
    EXPECT_EQ(test_ui::text(entry()), "");
    EXPECT_THAT(newLog(), Contains(isEmpty(0)));
    EXPECT_EQ(test_ui::text(titleLabel()), titleMarkup(icon(), "Title"));
}

TEST_F(InfoArea, TellsWhichTextIsEmpty) {
    writeTips({tip("a_01.png"), "<title>Title</title><contents></contents>"});
    open();
    settle();
    const auto lines = newLog();
    EXPECT_THAT(lines, Contains(isEmpty(1)));
    EXPECT_THAT(lines, Not(Contains(isEmpty(0))));
}

TEST_F(InfoArea, KeepsItsTitleBlackOnLightInTheDarkTheme) {
    device()->settings().set(device::keys::theme, "dark");
    openTip(tip("a_01.png"));
    settle();
    const test_ui::Picture picture = screen().picture();
    const test_ui::Rect title = test_ui::geometry(titleLabel());
    EXPECT_GT(picture.count(0x000000, title), 100);
    EXPECT_GT(picture.pixel(title.x + 4, title.y + 4), 0xD0D0D0U);
}

TEST_F(InfoArea, OfALongTitleWrapsAndScrolls) {
    std::string longTitle;
    while (longTitle.size() < 10000)
        longTitle += "title ";
    openTip("<title>" + longTitle + "</title>" + kest_files::contents("Text"));
    test_ui::runFor(1);
    EXPECT_THAT(test_ui::text(titleLabel()), HasSubstr(">" + longTitle + "</font_size>"));
    EXPECT_LE(test_ui::geometry(titleLabel()).width, 720);
    EXPECT_GT(test_ui::geometry(infoLayout()).height, test_ui::geometry(info()).height);
    EXPECT_EQ(title(), "Tips 1/1");
    EXPECT_THAT(newErrors(), IsEmpty());
}

TEST_F(InfoArea, OfOneWordOfTenThousandCharactersIsNoWiderThanThePage) {
    openTip("<title>" + std::string(10000, 'w') + "</title>" + kest_files::contents(std::string(10000, 'w')));
    test_ui::runFor(1);
    EXPECT_LE(test_ui::geometry(titleLabel()).width, 720);
    EXPECT_LE(test_ui::geometry(entry()).width, 720);
    EXPECT_GT(test_ui::geometry(infoLayout()).height, test_ui::geometry(info()).height);
}

TEST_F(InfoArea, HasAThousandLinks) {
    std::string text;
    for (int link = 0; link < 1000; ++link)
        text += "<a href=app" + std::to_string(link) + ">link</a> ";
    openTip(tip("a_01.png", text));
    test_ui::runFor(1);
    elm_scroller_region_show(info(), 0, test_ui::geometry(infoLayout()).height - 1, 1, 1);
    test_ui::runFor(0.1);
    ASSERT_NE(test_ui::link(entry(), "app999"), test_ui::Rect());
    screen().tap(test_ui::link(entry(), "app999").middle());
    EXPECT_EQ(device()->launches().all().size(), 1U);
}

TEST_F(InfoArea, OfBrokenMarkupShowsWhatItCan) {
    openTip(tip("a_01.png", "One </b> two <a href=app>three <b>four <> five </a></font></> &nonsense; <item"));
    test_ui::runFor(1);
    for (const char* word : {"One", "two", "three", "four", "five"})
        EXPECT_THAT(test_ui::plainText(entry()), HasSubstr(word));
}

TEST_F(InfoArea, OfAPictureThatIsNotThereShowsItsText) {
    openTip(tip("a_01.png", "Before <item size=40x40 href=file:contents/none.png></item> behind"));
    test_ui::runFor(1);
    EXPECT_THAT(test_ui::plainText(entry()), HasSubstr("Before"));
    EXPECT_THAT(test_ui::plainText(entry()), HasSubstr("behind"));
}
