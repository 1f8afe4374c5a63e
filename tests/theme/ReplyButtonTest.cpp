#include "PageTest.h"

namespace {

using test_ui::Point;
using testing::ElementsAre;
using testing::IsEmpty;

constexpr unsigned int red = 0xC03020;
constexpr unsigned int disc = 0x14181F;
constexpr unsigned int arrow = 0xFFFFFF;
constexpr unsigned int pressed = 0x064552;

/// The button over a picture. Its disc is 92 pixels wide, in the lower right corner of the area; the point looked at
/// lies on the disc, beside the arrow.
class ReplyButton : public PageTest {
protected:
    static constexpr Point button{718 - 84, 767 - 84};

    /// As at first, with the button away.
    void showPictures(Kind kind = {}, unsigned int colour = red) {
        startPage(kind);
        showSequence({picture(colour), picture(0x3020C0)});
        listen();
        test_ui::runFor(1);
    }
    void show(Kind kind = {}, unsigned int colour = red) {
        showPictures(kind, colour);
        say("reply,show");
    }
    void listen() { edje_object_signal_callback_add(elm_layout_edje_get(pictures_), "reply,*", "*", heard, this); }

    /// Answers as the application does while no demonstration runs.
    void answer() { answers_ = true; }
    void say(const char* signal, double seconds = 0.5) {
        elm_layout_signal_emit(pictures_, signal, "");
        test_ui::runFor(seconds);
        signals_.clear();
    }
    unsigned int look() { return screen().picture().pixel(button.x, button.y + 30); }

    std::vector<std::string> signals_;

private:
    static void heard(void* self, Evas_Object* edje, const char* signal, const char*) {
        auto* test = static_cast<ReplyButton*>(self);
        const std::string name = signal;
        test->signals_.push_back(name);
        if (!test->answers_)
            return;
        if (name == "reply,pressed" || name == "reply,uppressed")
            edje_object_signal_emit(edje, "reply,hide", "");
        if (name == "reply,pressed")
            edje_object_signal_emit(edje, "reply,press,show", "");
    }

    bool answers_ = false;
};

TEST_F(ReplyButton, IsAwayAtFirst) {
    showPictures();
    EXPECT_EQ(red, look());
    screen().tap(button);
    test_ui::runFor(0.3);
    EXPECT_THAT(signals_, IsEmpty());
}

TEST_F(ReplyButton, HasAnArrowOnItsDiscAndALineAroundItOnADarkPicture) {
    show({}, disc);
    const auto shown = screen().picture();
    EXPECT_GT(shown.count(arrow, {button.x - 30, button.y - 30, 60, 60}), 200);
    for (const Point rim : {Point{button.x, button.y - 45}, {button.x, button.y + 44}, {button.x - 45, button.y}})
        EXPECT_GT(shown.colours({rim.x - 2, rim.y - 2, 5, 5}), 1) << rim.x << "," << rim.y;
}

TEST_F(ReplyButton, GoesAwayAndComesBackWithoutAJump) {
    show();
    say("reply,hide", 0.1);
    EXPECT_FALSE(isNear(look(), disc)) << "it fades";
    EXPECT_FALSE(isNear(look(), red)) << "it fades";
    test_ui::runFor(0.3);
    EXPECT_EQ(red, look());
    say("reply,show", 0.1);
    EXPECT_FALSE(isNear(look(), disc)) << "it fades";
    EXPECT_FALSE(isNear(look(), red)) << "it fades";
    test_ui::runFor(0.5);
    EXPECT_THAT(look(), LooksLike(disc));
}

TEST_F(ReplyButton, TellsWhenAFingerIsPutOnItAndTakenAway) {
    show();
    screen().press(button);
    test_ui::runFor(0.3);
    EXPECT_THAT(signals_, ElementsAre("reply,pressed"));
    screen().lift();
    test_ui::runFor(0.3);
    EXPECT_THAT(signals_, ElementsAre("reply,pressed", "reply,uppressed"));
}

TEST_F(ReplyButton, TakesAFingerWithinMoreThanAHundredPixels) {
    show();
    for (const Point at : {Point{button.x - 56, button.y - 56},
                           {button.x + 60, button.y - 56},
                           {button.x - 56, button.y + 60},
                           {button.x + 60, button.y + 60}}) {
        signals_.clear();
        screen().tap(at);
        test_ui::runFor(0.6);
        EXPECT_THAT(signals_, ElementsAre("reply,pressed", "reply,uppressed")) << at.x << "," << at.y;
    }
    signals_.clear();
    screen().tap({button.x - 100, button.y});
    test_ui::runFor(0.3);
    EXPECT_THAT(signals_, IsEmpty());
}

TEST_F(ReplyButton, ShowsThatItIsPressedUntilItIsReleased) {
    show();
    answer();
    screen().press(button);
    test_ui::runFor(1);
    EXPECT_THAT(look(), LooksLike(pressed));
    screen().lift();
    test_ui::runFor(0.5);
    EXPECT_EQ(red, look());
    EXPECT_THAT(signals_,
                ElementsAre("reply,pressed", "reply,hide", "reply,press,show", "reply,uppressed", "reply,hide"));
    say("reply,show");
    EXPECT_THAT(look(), LooksLike(disc)) << "at rest, not pressed";
}

TEST_F(ReplyButton, CannotBeTouchedWhileItIsAway) {
    show();
    say("reply,hide");
    screen().tap(button);
    test_ui::runFor(0.5);
    EXPECT_THAT(signals_, IsEmpty());
    say("reply,show");
    screen().tap(button);
    test_ui::runFor(0.5);
    EXPECT_THAT(signals_, ElementsAre("reply,pressed", "reply,uppressed"));
}

TEST_F(ReplyButton, IsAwayWhereTheApplicationSaysSoAgainAtOnce) {
    show();
    elm_layout_signal_emit(pictures_, "reply,show", "");
    say("reply,hide");
    EXPECT_EQ(red, look());
    elm_layout_signal_emit(pictures_, "reply,hide", "");
    say("reply,show");
    EXPECT_THAT(look(), LooksLike(disc));
    screen().tap(button);
    test_ui::runFor(0.3);
    EXPECT_THAT(signals_, ElementsAre("reply,pressed", "reply,uppressed"));
}

TEST_F(ReplyButton, DoesNotTakeTheApplicationsReleaseForAFinger) {
    show();
    elm_layout_signal_emit(pictures_, "reply,uppressed", "");
    test_ui::runFor(0.5);
    EXPECT_THAT(signals_, ElementsAre("reply,uppressed"));
    EXPECT_THAT(look(), LooksLike(disc));
}

TEST_F(ReplyButton, StaysInTheLowerRightCornerOfASmallScreenToo) {
    show({.isLarge = false});
    const auto shown = screen().picture();
    EXPECT_THAT(shown.pixel(479 - 55, 442 - 55 + 20), LooksLike(disc));
    screen().tap({479 - 55, 442 - 55});
    test_ui::runFor(0.3);
    EXPECT_THAT(signals_, ElementsAre("reply,pressed", "reply,uppressed"));
}

TEST_F(ReplyButton, IsInTheOtherCornerWhereOneReadsFromRightToLeft) {
    elm_config_mirrored_set(EINA_TRUE);
    show();
    EXPECT_EQ(red, look());
    EXPECT_THAT(screen().picture().pixel(719 - button.x, button.y + 30), LooksLike(disc));
    screen().tap({719 - button.x, button.y});
    test_ui::runFor(0.3);
    EXPECT_THAT(signals_, ElementsAre("reply,pressed", "reply,uppressed"));
}

/// The page inside a pager that the user swipes.
class ReplyButtonInAPager : public ReplyButton {
protected:
    void showPager() {
        start();
        pager_ = elm_scroller_add(naviframe_);
        elm_scroller_policy_set(pager_, ELM_SCROLLER_POLICY_OFF, ELM_SCROLLER_POLICY_OFF);
        elm_scroller_page_scroll_limit_set(pager_, 1, 0);
        elm_scroller_page_relative_set(pager_, 1, 0);
        Evas_Object* box = elm_box_add(pager_);
        elm_box_horizontal_set(box, EINA_TRUE);
        elm_object_content_set(pager_, box);
        elm_naviframe_item_push(naviframe_, nullptr, nullptr, nullptr, pager_, nullptr);
        for (int i = 0; i < 2; ++i)
            elm_box_pack_end(box, sized(box, i == 0));
        test_ui::runFor(1);
    }

    /// The page in view, by its number.
    int page() const {
        int number = -1;
        elm_scroller_current_page_get(pager_, &number, nullptr);
        return number;
    }

    Evas_Object* pager_ = nullptr;

private:
    Evas_Object* sized(Evas_Object* box, bool withPictures) {
        Evas_Object* table = elm_table_add(box);
        Evas_Object* sizer = evas_object_rectangle_add(evas_object_evas_get(box));
        evas_object_size_hint_min_set(sizer, 720, 1168);
        elm_table_pack(table, sizer, 0, 0, 1, 1);
        layout_ = add(table, "kest/content/main");
        evas_object_size_hint_align_set(layout_, EVAS_HINT_FILL, EVAS_HINT_FILL);
        elm_table_pack(table, layout_, 0, 0, 1, 1);
        evas_object_show(table);
        if (withPictures) {
            width_ = 716;
            height_ = 655;
            showSequence({picture(red), picture(0x3020C0)});
            listen();
            elm_layout_signal_emit(pictures_, "reply,show", "");
        }
        return table;
    }
};

TEST_F(ReplyButtonInAPager, LetsASwipeThatBeginsOnItTurnThePageAndIsNotPressedAfterwards) {
    showPager();
    answer();
    screen().press(button);
    test_ui::runFor(0.2);
    EXPECT_THAT(look(), LooksLike(pressed));
    screen().lift();
    test_ui::runFor(0.5);
    say("reply,show");
    screen().swipe(button, {button.x - 450, button.y});
    test_ui::runFor(2);
    EXPECT_EQ(1, page());
    EXPECT_THAT(signals_, ElementsAre("reply,pressed", "reply,hide", "reply,press,show"))
        << "a finger that was dragged away does not replay";
    elm_scroller_page_show(pager_, 0, 0);
    test_ui::runFor(0.5);
    EXPECT_THAT(look(), LooksLike(disc));
}

TEST_F(ReplyButtonInAPager, LetsASwipeBeginAnywhereOnThePage) {
    showPager();
    for (const Point from : {Point{600, 400}, {600, 120}, {600, 760}, {600, 1000}, {700, 1270}}) {
        elm_scroller_page_show(pager_, 0, 0);
        test_ui::runFor(0.5);
        screen().swipe(from, {from.x - 450, from.y});
        test_ui::runFor(2);
        EXPECT_EQ(1, page()) << from.x << "," << from.y;
    }
}

}  // namespace
