#include "PagerTest.h"
#include "TimerCalls.h"

using calls::Timer;
using testing::ElementsAre;

/// Whatever is still to come goes with the object that it is about.
class TimerOwner : public PagerTest {
protected:
    /// Opens a pager of one page, and hears of what it starts from then on.
    void openAtRest() {
        writeTip();
        open();
        test_ui::runFor(10);
        calls::newTimers();
    }
};

TEST_F(TimerOwner, OfWhatFillsThePagesIsThePager) {
    drawPicture("a_01.png");
    writeTip();
    startEmpty();
    calls::newTimers();
    push();
    test_ui::runFor(0.1);
    Evas_Object* all = pager().getEvasObj();
    EXPECT_THAT(calls::newTimers(), ElementsAre(Timer{0, all}, Timer{0.4, all}));
    test_ui::runFor(1);
    EXPECT_THAT(calls::newTimers(), ElementsAre(Timer{0, all}));
}

TEST_F(TimerOwner, OfASequenceIsItsArea) {
    drawSequence(2, {0, 1});
    openAtRest();
    releaseReply();
    test_ui::runFor(10);
    EXPECT_THAT(calls::newTimers(),
                ElementsAre(Timer{1, video()}, Timer{2, video()}, Timer{1, video()}, Timer{2, video()}));
}

TEST_F(TimerOwner, OfATallPictureIsItsArea) {
    drawPicture("a_01.png", 716, 900);
    openAtRest();
    releaseReply();
    test_ui::runFor(10);
    EXPECT_THAT(calls::newTimers(), ElementsAre(Timer{2, video()}));
}

TEST_F(TimerOwner, OfTheNewLanguageIsThePage) {
    drawPicture("a_01.png");
    openAtRest();
    setLanguage("ko_KR.UTF-8");
    test_ui::runFor(1);
    EXPECT_THAT(calls::newTimers(), ElementsAre(Timer{0.5, page()}));
}
