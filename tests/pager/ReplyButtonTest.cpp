#include "PagerTest.h"

using testing::ElementsAre;
using testing::IsEmpty;
using testing::Pair;

/// The button that has a sequence play again, and what the page does when the theme tells of it.
class ReplyButton : public PagerTest {
protected:
    /// Opens a sequence and lets it play for so long.
    void play(int count, const std::set<int>& marked, double seconds) {
        drawSequence(count, marked);
        writeTip();
        open();
        test_ui::runFor(seconds);
        calls::forget();
    }
    /// Opens a sequence that has come to its end.
    void playToItsEnd() { play(2, {}, 6); }

    /// Where the theme draws it, near the area's lower right corner.
    test_ui::Point button() {
        const test_ui::Rect area = test_ui::geometry(video());
        return {area.x + area.width - 84, area.y + area.height - 84};
    }
};

TEST_F(ReplyButton, ShowsThatItIsPressed) {
    playToItsEnd();
    pressReply();
    EXPECT_THAT(calls::story(), ElementsAre("0.0 record", "0.0 area reply,hide", "0.0 area reply,press,show"));
}

TEST_F(ReplyButton, CountsASecondPressSoonAfterTheFirst) {
    playToItsEnd();
    screen().tap(button());
    test_ui::runFor(0.1);
    // As a display tells of it.
    test_ui::inMainLoop([&] {
        evas_event_feed_mouse_down(screen().canvas(), 1, EVAS_BUTTON_DOUBLE_CLICK,
                                   static_cast<unsigned int>(ecore_time_get() * 1000), nullptr);
    });
    test_ui::runFor(0.01);
    EXPECT_EQ(device()->usage().all().size(), 2U);
    screen().lift();
}

TEST_F(ReplyButton, StaysHiddenWhenItIsPressedWhileTheFirstPictureIsShown) {
    play(2, {0}, 0.5);
    pressReply();
    EXPECT_THAT(calls::story(), ElementsAre("0.0 record", "0.0 area reply,hide"));
}

TEST_F(ReplyButton, StaysHiddenWhenItIsPressedBeforeTheNextPictureComes) {
    play(2, {}, 0.5);
    pressReply();
    EXPECT_THAT(calls::story(), ElementsAre("0.0 record", "0.0 area reply,hide"));
}

TEST_F(ReplyButton, StaysHiddenWhenItIsPressedWhileTheMarkerIsShown) {
    play(2, {0}, 1.5);
    pressReply();
    EXPECT_THAT(calls::story(), ElementsAre("0.0 record", "0.0 area reply,hide"));
}

TEST_F(ReplyButton, HearsNoPressWhileALaterPictureIsShown) {
    play(3, {}, 3);
    pressReply();
    EXPECT_THAT(calls::story(), ElementsAre("0.0 record"));
}

TEST_F(ReplyButton, HearsNoReleaseWhileALaterPictureIsShown) {
    play(3, {}, 3);
    releaseReply();
    test_ui::runFor(20);
    EXPECT_THAT(calls::story(),
                ElementsAre("1.0 pictures to page 2", "3.0 pictures to page 0", "3.0 picture 0 touch,hide",
                            "3.0 picture 1 touch,hide", "3.0 area reply,show"));
}

TEST_F(ReplyButton, PressedWhileItPlaysLetsItPlayOn) {
    play(2, {0}, 0.5);
    pressReply();
    test_ui::runFor(20);
    EXPECT_THAT(calls::story(),
                ElementsAre("0.0 record", "0.0 area reply,hide", "0.5 picture 0 touch,show", "2.5 pictures to page 1",
                            "4.5 pictures to page 0", "4.5 picture 0 touch,hide", "4.5 area reply,show"));
}

TEST_F(ReplyButton, ReleasedWhileTheMarkerIsAwaitedWaitsAnew) {
    play(2, {0}, 0.5);
    releaseReply();
    test_ui::runFor(20);
    EXPECT_THAT(calls::story(),
                ElementsAre("0.0 area reply,hide", "1.0 picture 0 touch,show", "3.0 pictures to page 1",
                            "5.0 pictures to page 0", "5.0 picture 0 touch,hide", "5.0 area reply,show"));
}

TEST_F(ReplyButton, ReleasedWhileTheMarkerIsShownWaitsAnew) {
    play(2, {0}, 2);
    releaseReply();
    test_ui::runFor(20);
    EXPECT_THAT(calls::story(),
                ElementsAre("0.0 area reply,hide", "1.0 picture 0 touch,show", "3.0 pictures to page 1",
                            "5.0 pictures to page 0", "5.0 picture 0 touch,hide", "5.0 area reply,show"));
}

TEST_F(ReplyButton, ReleasedManyTimesPlaysOnce) {
    playToItsEnd();
    for (int time = 0; time < 5; ++time)
        releaseReply();
    calls::forget();
    test_ui::runFor(20);
    EXPECT_THAT(calls::story(), ElementsAre("2.0 pictures to page 1", "4.0 pictures to page 0",
                                            "4.0 picture 0 touch,hide", "4.0 area reply,show"));
}

TEST_F(ReplyButton, PressedAfterAReplayShowsThatItIsPressed) {
    playToItsEnd();
    releaseReply();
    test_ui::runFor(6);
    calls::forget();
    pressReply();
    EXPECT_THAT(calls::story(), ElementsAre("0.0 record", "0.0 area reply,hide", "0.0 area reply,press,show"));
}

TEST_F(ReplyButton, WritesOneRecordAPress) {
    playToItsEnd();
    pressReply();
    const auto records = device()->usage().all();
    ASSERT_EQ(records.size(), 1U);
    EXPECT_THAT(records[0].uri, testing::MatchesRegex("content://[^/]+/log/use_app_feature_survey"));
    EXPECT_THAT(records[0].values, ElementsAre(Pair("app_id", "com.ravella.kest"), Pair("feature", "KT02")));
}

TEST_F(ReplyButton, WritesARecordAlsoWhileItPlays) {
    play(3, {}, 0.5);
    pressReply();
    test_ui::runFor(2);
    ASSERT_EQ(pictureInView(), 1);
    pressReply();
    EXPECT_EQ(device()->usage().all().size(), 2U);
}

TEST_F(ReplyButton, WritesNoRecordWhenItIsReleased) {
    playToItsEnd();
    releaseReply();
    test_ui::runFor(6);
    EXPECT_THAT(device()->usage().all(), IsEmpty());
}

TEST_F(ReplyButton, WritesNoRecordWhenThePageIsDisplayed) {
    playToItsEnd();
    test_ui::inMainLoop([&] { pager().showContentsPage(0); });
    test_ui::runFor(6);
    EXPECT_THAT(device()->usage().all(), IsEmpty());
}

TEST_F(ReplyButton, WorksWhenTheUsageLogFails) {
    playToItsEnd();
    device::faults::plan("ravella_log_manager_create", -5);
    device::faults::plan("ravella_log_manager_insert", -5);
    newLog();
    pressReply();
    EXPECT_THAT(calls::story(), ElementsAre("0.0 record", "0.0 area reply,hide", "0.0 area reply,press,show"));
    EXPECT_THAT(newLog(), IsEmpty());
}

TEST_F(ReplyButton, IsHeardWhateverPartOfTheThemeTellsOfIt) {
    playToItsEnd();
    edje_object_signal_emit(elm_layout_edje_get(video()), "reply,pressed", "");
    edje_object_signal_emit(elm_layout_edje_get(video()), "reply,pressed", "some.part");
    test_ui::runFor(0.01);
    EXPECT_EQ(device()->usage().all().size(), 2U);
}

TEST_F(ReplyButton, IsTappedByAFinger) {
    playToItsEnd();
    test_ui::runFor(1);
    calls::forget();
    screen().tap(button());
    test_ui::runFor(20);
    EXPECT_THAT(calls::story(),
                ElementsAre("0.0 record", "0.0 area reply,hide", "0.0 area reply,press,show", "0.1 area reply,hide",
                            "0.1 picture 0 touch,hide", "2.1 pictures to page 1", "4.1 pictures to page 0",
                            "4.1 picture 0 touch,hide", "4.1 area reply,show"));
    EXPECT_EQ(device()->usage().all().size(), 1U);
}

TEST_F(ReplyButton, IsNotThereForAFingerWhileItPlays) {
    play(3, {}, 1);
    screen().tap(button());
    EXPECT_THAT(calls::story(), IsEmpty());
    EXPECT_THAT(device()->usage().all(), IsEmpty());
}
