#include "PagerTest.h"

using testing::ElementsAre;
using testing::IsEmpty;

/// A sequence of pictures, which pages on by itself from the moment that its page is displayed.
class Sequence : public PagerTest {
protected:
    void play(int count, const std::set<int>& marked, double seconds) {
        drawSequence(count, marked);
        writeTip();
        open();
        test_ui::runFor(seconds);
    }
    /// A story that begins as that of every sequence, and goes on with `rest`.
    template <class... Lines>
    static auto tells(int count, const Lines&... rest) {
        std::vector<std::string> lines = {"0.0 pictures to page 0", "0.0 pictures at page 0",
                                          "0.0 area reply,uppressed", "0.0 info show"};
        for (int picture = 0; picture < count - 1; ++picture)
            lines.push_back("0.0 picture " + std::to_string(picture) + " touch,hide");
        lines.emplace_back("0.0 area reply,hide");
        (lines.emplace_back(rest), ...);
        return testing::ElementsAreArray(lines);
    }
};

TEST_F(Sequence, OfTwoPicturesShowsEachForTwoSeconds) {
    play(2, {}, 20);
    EXPECT_THAT(calls::story(), tells(2, "0.0 picture 0 touch,hide", "2.0 pictures to page 1", "4.0 pictures to page 0",
                                      "4.0 picture 0 touch,hide", "4.0 area reply,show"));
}

TEST_F(Sequence, OfFivePicturesShowsEachForTwoSeconds) {
    play(5, {}, 20);
    EXPECT_THAT(calls::story(),
                tells(5, "0.0 picture 0 touch,hide", "2.0 pictures to page 1", "4.0 pictures to page 2",
                      "6.0 pictures to page 3", "8.0 pictures to page 4", "10.0 pictures to page 0",
                      "10.0 picture 0 touch,hide", "10.0 picture 1 touch,hide", "10.0 picture 2 touch,hide",
                      "10.0 picture 3 touch,hide", "10.0 area reply,show"));
}

TEST_F(Sequence, OfTwoMarkedPicturesShowsEachMarkerASecondLater) {
    play(2, {0, 1}, 20);
    EXPECT_THAT(calls::story(),
                tells(2, "1.0 picture 0 touch,show", "3.0 pictures to page 1", "4.0 picture 1 touch,show",
                      "6.0 pictures to page 0", "6.0 picture 0 touch,hide", "6.0 area reply,show"));
}

TEST_F(Sequence, OfFiveMarkedPicturesShowsEachMarkerASecondLater) {
    play(5, {0, 1, 2, 3, 4}, 30);
    EXPECT_THAT(calls::story(),
                tells(5, "1.0 picture 0 touch,show", "3.0 pictures to page 1", "4.0 picture 1 touch,show",
                      "6.0 pictures to page 2", "7.0 picture 2 touch,show", "9.0 pictures to page 3",
                      "10.0 picture 3 touch,show", "12.0 pictures to page 4", "13.0 picture 4 touch,show",
                      "15.0 pictures to page 0", "15.0 picture 0 touch,hide", "15.0 picture 1 touch,hide",
                      "15.0 picture 2 touch,hide", "15.0 picture 3 touch,hide", "15.0 area reply,show"));
}

TEST_F(Sequence, MixesPicturesWithAndWithoutMarkers) {
    play(5, {0, 2, 3}, 30);
    EXPECT_THAT(calls::story(), tells(5, "1.0 picture 0 touch,show", "3.0 pictures to page 1", "5.0 pictures to page 2",
                                      "6.0 picture 2 touch,show", "8.0 pictures to page 3", "9.0 picture 3 touch,show",
                                      "11.0 pictures to page 4", "13.0 pictures to page 0", "13.0 picture 0 touch,hide",
                                      "13.0 picture 1 touch,hide", "13.0 picture 2 touch,hide",
                                      "13.0 picture 3 touch,hide", "13.0 area reply,show"));
}

TEST_F(Sequence, ReplacesTheTimerThatBroughtAMarkedPicture) {
    play(3, {1}, 30);
    EXPECT_THAT(calls::story(), tells(3, "0.0 picture 0 touch,hide", "2.0 pictures to page 1",
                                      "3.0 picture 1 touch,show", "5.0 pictures to page 2", "7.0 pictures to page 0",
                                      "7.0 picture 0 touch,hide", "7.0 picture 1 touch,hide", "7.0 area reply,show"));
}

TEST_F(Sequence, LeavesTheMarkerOfTheLastPictureAlone) {
    play(2, {1}, 30);
    EXPECT_THAT(calls::story(),
                tells(2, "0.0 picture 0 touch,hide", "2.0 pictures to page 1", "3.0 picture 1 touch,show",
                      "5.0 pictures to page 0", "5.0 picture 0 touch,hide", "5.0 area reply,show"));
}

TEST_F(Sequence, ShowsItsPicturesOneAfterTheOther) {
    play(3, {1}, 0);
    std::vector<int> seen;
    for (int half = 0; half < 16; ++half) {
        if (seen.empty() || seen.back() != pictureInView())
            seen.push_back(pictureInView());
        test_ui::runFor(0.5);
    }
    EXPECT_THAT(seen, ElementsAre(0, 1, 2, 0));
}

TEST_F(Sequence, StandsStillAfterItsEnd) {
    play(2, {0, 1}, 7);
    calls::forget();
    test_ui::runFor(60);
    EXPECT_THAT(calls::story(), IsEmpty());
    EXPECT_EQ(pictureInView(), 0);
}

TEST_F(Sequence, PlaysAgainWhenItsButtonIsReleased) {
    play(2, {}, 6);
    calls::forget();
    releaseReply();
    test_ui::runFor(20);
    EXPECT_THAT(calls::story(),
                ElementsAre("0.0 area reply,hide", "0.0 picture 0 touch,hide", "2.0 pictures to page 1",
                            "4.0 pictures to page 0", "4.0 picture 0 touch,hide", "4.0 area reply,show"));
}

TEST_F(Sequence, BehavesTheSameAtEveryReplay) {
    play(3, {0, 2}, 20);
    calls::forget();
    releaseReply();
    test_ui::runFor(20);
    const auto first = calls::story();
    calls::forget();
    releaseReply();
    test_ui::runFor(20);
    EXPECT_EQ(calls::story(), first);
    EXPECT_THAT(first, testing::Contains("8.0 pictures to page 0"));
}

TEST_F(Sequence, ThatSomethingBroughtBackGoesOnFromThere) {
    play(3, {}, 3);
    ASSERT_EQ(pictureInView(), 1);
    elm_scroller_page_show(pictureScroller(), 0, 0);
    calls::forget();
    test_ui::runFor(20);
    EXPECT_THAT(calls::story(),
                ElementsAre("1.0 pictures to page 1", "3.0 pictures to page 2", "5.0 pictures to page 0",
                            "5.0 picture 0 touch,hide", "5.0 picture 1 touch,hide", "5.0 area reply,show"));
}

TEST_F(Sequence, OfMarkedPicturesThatSomethingBroughtBackShowsTheMarkerThatIsInView) {
    play(3, {0, 1}, 3.5);
    ASSERT_EQ(pictureInView(), 1);
    elm_scroller_page_show(pictureScroller(), 0, 0);
    calls::forget();
    test_ui::runFor(20);
    EXPECT_THAT(calls::story(),
                ElementsAre("0.5 picture 0 touch,show", "2.5 pictures to page 1", "3.5 picture 1 touch,show",
                            "5.5 pictures to page 2", "7.5 pictures to page 0", "7.5 picture 0 touch,hide",
                            "7.5 picture 1 touch,hide", "7.5 area reply,show"));
}

TEST_F(Sequence, OnAnotherPageWaitsUntilThatIsDisplayed) {
    drawSequence(2);
    drawPicture("plain.png");
    writeTips({tip("plain.png"), tip("a_01.png")});
    open();
    test_ui::runFor(20);
    EXPECT_THAT(calls::story(1), ElementsAre("0.4 pictures to page 0"));
}
