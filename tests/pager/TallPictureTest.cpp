#include "PagerTest.h"

using testing::ElementsAre;
using testing::IsEmpty;

/// One picture that is higher than its area, and scrolls down by itself.
class TallPicture : public PagerTest {
protected:
    void play(int height, double seconds) {
        drawPicture("a_01.png", 716, height);
        writeTip();
        open();
        test_ui::runFor(seconds);
    }
};

TEST_F(TallPicture, ScrollsDownAndBack) {
    play(800, 20);
    EXPECT_THAT(calls::story(),
                ElementsAre("0.0 pictures to y 0", "0.0 area reply,uppressed", "0.0 info show", "0.0 area reply,hide",
                            "2.0 pictures to y 145", "4.0 pictures to y 0", "4.0 area reply,show"));
}

TEST_F(TallPicture, IsSeenDownToItsEnd) {
    play(1000, 3);
    EXPECT_EQ(scrolledTo(), 345);
    test_ui::runFor(2);
    EXPECT_EQ(scrolledTo(), 0);
}

TEST_F(TallPicture, ScrollsWhenItIs101PixelsTooHigh) {
    play(756, 20);
    EXPECT_THAT(calls::story(),
                ElementsAre("0.0 pictures to y 0", "0.0 area reply,uppressed", "0.0 info show", "0.0 area reply,hide",
                            "2.0 pictures to y 101", "4.0 pictures to y 0", "4.0 area reply,show"));
}

TEST_F(TallPicture, StandsStillWhenItIs100PixelsTooHigh) {
    play(755, 20);
    EXPECT_THAT(calls::story(), ElementsAre("0.0 info show"));
}

TEST_F(TallPicture, ThatStandsStillHasNoButtonEither) {
    play(755, 1);
    calls::forget();
    EXPECT_STREQ(edje_object_part_state_get(elm_layout_edje_get(video()), "reply.clip", nullptr), "default");
    pressReply();
    releaseReply();
    test_ui::runFor(20);
    EXPECT_THAT(calls::story(), IsEmpty());
    EXPECT_THAT(device()->usage().all(), IsEmpty());
}

TEST_F(TallPicture, StandsStillAfterItsEnd) {
    play(800, 5);
    calls::forget();
    test_ui::runFor(60);
    EXPECT_THAT(calls::story(), IsEmpty());
}

TEST_F(TallPicture, PlaysAgainWhenItsButtonIsReleased) {
    play(800, 6);
    calls::forget();
    releaseReply();
    test_ui::runFor(20);
    EXPECT_THAT(calls::story(), ElementsAre("0.0 area reply,hide", "2.0 pictures to y 145", "4.0 pictures to y 0",
                                            "4.0 area reply,show"));
}

TEST_F(TallPicture, ShowsItsButtonPressedAtRest) {
    play(800, 6);
    calls::forget();
    pressReply();
    EXPECT_THAT(calls::story(), ElementsAre("0.0 area reply,hide", "0.0 area reply,press,show"));
}

TEST_F(TallPicture, DoesNotShowItsButtonPressedWhileItPlays) {
    play(800, 1);
    calls::forget();
    pressReply();
    EXPECT_THAT(calls::story(), ElementsAre("0.0 area reply,hide"));
}

TEST_F(TallPicture, HearsNoButtonWhileItIsScrolledDown) {
    play(800, 3);
    calls::forget();
    pressReply();
    releaseReply();
    EXPECT_THAT(calls::story(), IsEmpty());
    test_ui::runFor(20);
    EXPECT_THAT(calls::story(), ElementsAre("1.0 pictures to y 0", "1.0 area reply,show"));
}

TEST_F(TallPicture, WaitsAnewWhenItsButtonIsReleasedAgain) {
    play(800, 1);
    calls::forget();
    releaseReply();
    test_ui::runFor(20);
    EXPECT_THAT(calls::story(), ElementsAre("0.0 area reply,hide", "2.0 pictures to y 145", "4.0 pictures to y 0",
                                            "4.0 area reply,show"));
}

TEST_F(TallPicture, WritesNoUsageRecord) {
    play(800, 6);
    pressReply();
    releaseReply();
    test_ui::runFor(6);
    EXPECT_THAT(device()->usage().all(), IsEmpty());
}

TEST_F(TallPicture, StartsOverAtOnceWhenItIsDisplayedWhileScrolledDown) {
    play(800, 3);
    calls::forget();
    test_ui::inMainLoop([&] { pager().showContentsPage(0); });
    EXPECT_EQ(scrolledTo(), 0);
    test_ui::runFor(20);
    EXPECT_THAT(calls::story(),
                ElementsAre("0.0 pictures at y 0", "0.0 area reply,uppressed", "0.0 info show", "0.0 area reply,hide",
                            "2.0 pictures to y 145", "4.0 pictures to y 0", "4.0 area reply,show"));
}

TEST_F(TallPicture, ThatSomethingBroughtBackScrollsDownAgain) {
    play(800, 3.5);
    ASSERT_EQ(scrolledTo(), 145);
    elm_scroller_region_show(pictureScroller(), 0, 0, 716, 655);
    ASSERT_EQ(scrolledTo(), 0);
    calls::forget();
    pressReply();
    test_ui::runFor(1.4);
    EXPECT_EQ(scrolledTo(), 145);
    test_ui::runFor(20);
    EXPECT_THAT(calls::story(), ElementsAre("0.0 area reply,hide", "0.5 pictures to y 145", "2.5 pictures to y 0",
                                            "2.5 area reply,show"));
}

TEST_F(TallPicture, ThatSomethingScrolledDownComesBackInstead) {
    play(800, 1);
    elm_scroller_region_show(pictureScroller(), 0, 60, 716, 655);
    ASSERT_EQ(scrolledTo(), 60);
    calls::forget();
    test_ui::runFor(20);
    EXPECT_THAT(calls::story(), ElementsAre("1.0 pictures to y 0", "1.0 area reply,show"));
    EXPECT_EQ(scrolledTo(), 0);
}

TEST_F(TallPicture, GivesItsButtonBackWhereTheDisplayShowsAllOfIt) {
    useSmallScreen();
    play(760, 20);
    EXPECT_THAT(calls::story(),
                ElementsAre("0.0 pictures to y 0", "0.0 area reply,uppressed", "0.0 info show", "0.0 area reply,hide",
                            "2.0 pictures to y 105", "4.0 pictures to y 0", "4.0 area reply,show"));
}
