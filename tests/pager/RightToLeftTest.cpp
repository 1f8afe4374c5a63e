#include "PagerTest.h"

using testing::ElementsAre;

/// Where reading begins at the right, the first page and the first picture lie there. All else is the same.
class RightToLeft : public PagerTest {
protected:
    RightToLeft() { setLanguage("ar_AE.UTF-8"); }

    void openSequence(const std::set<int>& marked) {
        drawSequence(2, marked);
        writeTips({tip("a_01.png"), tip("a_01.png")});
        open();
        ASSERT_TRUE(elm_object_mirrored_get(pictureScroller()));
    }
    /// What the page asked for. The platform answers the showing of a page with a movement of its own.
    static std::vector<std::string> story(int index = 0) {
        std::vector<std::string> lines = calls::story(index);
        const auto isAnswer = [](const std::string& line) { return line.find(" pictures at y ") != std::string::npos; };
        lines.erase(std::remove_if(lines.begin(), lines.end(), isAnswer), lines.end());
        return lines;
    }
};

TEST_F(RightToLeft, ASequencePlaysInItsOrder) {
    openSequence({});
    test_ui::runFor(20);
    EXPECT_THAT(story(), ElementsAre("0.0 pictures to page 0", "0.0 pictures at page 0", "0.0 area reply,uppressed",
                                     "0.0 info show", "0.0 picture 0 touch,hide", "0.0 area reply,hide",
                                     "0.0 picture 0 touch,hide", "2.0 pictures to page 1", "4.0 pictures to page 0",
                                     "4.0 picture 0 touch,hide", "4.0 area reply,show"));
}

TEST_F(RightToLeft, AMarkedSequencePlaysInItsOrder) {
    openSequence({0, 1});
    test_ui::runFor(20);
    EXPECT_THAT(story(), ElementsAre("0.0 pictures to page 0", "0.0 pictures at page 0", "0.0 area reply,uppressed",
                                     "0.0 info show", "0.0 picture 0 touch,hide", "0.0 area reply,hide",
                                     "1.0 picture 0 touch,show", "3.0 pictures to page 1", "4.0 picture 1 touch,show",
                                     "6.0 pictures to page 0", "6.0 picture 0 touch,hide", "6.0 area reply,show"));
}

TEST_F(RightToLeft, TheNextPictureComesFromTheLeft) {
    openSequence({});
    const int area = test_ui::geometry(pictureScroller()).x;
    test_ui::runFor(1);
    EXPECT_EQ(test_ui::geometry(pictures()[0]).x, area);
    EXPECT_LT(test_ui::geometry(pictures()[1]).x, area);
    test_ui::runFor(2);
    EXPECT_EQ(test_ui::geometry(pictures()[1]).x, area);
    EXPECT_GT(test_ui::geometry(pictures()[0]).x, area);
}

TEST_F(RightToLeft, ASwipeToTheRightBringsTheNextPage) {
    openSequence({});
    test_ui::runFor(6);
    EXPECT_LT(test_ui::geometry(page(1)).x, 0);
    calls::forget();
    swipe(-1);
    test_ui::runFor(10);
    EXPECT_EQ(pageInView(), 1);
    EXPECT_EQ(test_ui::geometry(page(1)).x, 0);
    EXPECT_THAT(story(1), ElementsAre("0.2 pictures at page 0", "0.2 picture 0 touch,hide", "0.7 pictures at page 0",
                                      "0.7 area reply,uppressed", "0.7 info show", "0.7 picture 0 touch,hide",
                                      "0.7 area reply,hide", "0.7 picture 0 touch,hide", "2.7 pictures to page 1",
                                      "4.7 pictures to page 0", "4.7 picture 0 touch,hide", "4.7 area reply,show"));
}
