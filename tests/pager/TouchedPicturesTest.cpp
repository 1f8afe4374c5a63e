#include "PagerTest.h"

using testing::Contains;
using testing::EndsWith;

/// A finger on pictures that move by themselves. The parameter is how long it stays.
class TouchedPictures : public PagerTest, public testing::WithParamInterface<double> {
protected:
    void openSequence(double seconds) {
        drawSequence(3);
        openPage(seconds);
    }
    void openTall(double seconds) {
        drawPicture("a_01.png", 716, 800);
        openPage(seconds);
    }
    void touch() { screen().tap(test_ui::geometry(video()).middle(), GetParam()); }
    /// Touches the reply button.
    void reply() {
        const test_ui::Rect area = test_ui::geometry(video());
        screen().tap({area.x + area.width - 80, area.y + area.height - 80});
    }

private:
    void openPage(double seconds) {
        writeTip();
        open();
        test_ui::runFor(seconds);
    }
};

INSTANTIATE_TEST_SUITE_P(Fingers, TouchedPictures, testing::Values(0.05, 1.0),
                         [](const auto& finger) { return finger.param < 0.5 ? "ThatTap" : "ThatStay"; });

TEST_P(TouchedPictures, GoOnToTheNextOne) {
    openSequence(2.1);
    touch();
    test_ui::runFor(0.8);
    EXPECT_EQ(pictureInView(), 1);
}

TEST_P(TouchedPictures, GoOnToTheirStartAndPlayAgain) {
    openSequence(6.1);
    touch();
    test_ui::runFor(1);
    EXPECT_EQ(pictureInView(), 0);
    calls::forget();
    reply();
    test_ui::runFor(20);
    EXPECT_THAT(calls::story(), Contains(EndsWith(" pictures to page 2")));
    ASSERT_FALSE(calls::story().empty());
    EXPECT_THAT(calls::story().back(), EndsWith("area reply,show"));
}

TEST_P(TouchedPictures, ThatAreTallGoOnDown) {
    openTall(2.1);
    touch();
    test_ui::runFor(0.8);
    EXPECT_EQ(scrolledTo(), 145);
}

TEST_P(TouchedPictures, ThatAreTallGoOnUpAndPlayAgain) {
    openTall(4.1);
    touch();
    test_ui::runFor(1);
    EXPECT_EQ(scrolledTo(), 0);
    calls::forget();
    reply();
    test_ui::runFor(20);
    EXPECT_THAT(calls::story(), Contains(EndsWith(" pictures to y 145")));
    ASSERT_FALSE(calls::story().empty());
    EXPECT_THAT(calls::story().back(), EndsWith("area reply,show"));
}
