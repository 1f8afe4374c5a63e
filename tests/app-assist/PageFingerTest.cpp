#include "PageMovementTest.h"

#include <gmock/gmock.h>

using testing::ElementsAre;

namespace {

using PageFinger = PageMovement;

TEST_F(PageFinger, AFlickOfAThirdOfTheScreenTurnsThePage) {
    listenTo(1);
    for (const double seconds : {0.1, 0.2, 0.3}) {
        screen().swipe({600, 700}, {360, 700}, seconds);
        test_ui::runFor(2.0);
        EXPECT_THAT(heard(), ElementsAre("start", "stop 2")) << seconds;
        screen().swipe({120, 700}, {360, 700}, seconds);
        test_ui::runFor(2.0);
        EXPECT_THAT(heard(), ElementsAre("start", "stop 1")) << seconds;
    }
}

TEST_F(PageFinger, AFlickOfAThirdOfASmallScreenTurnsThePageAndAShortOneDoesNot) {
    evas_object_resize(naviframe_.getEvasObj(), 480, 800);
    listenTo(1);
    screen().swipe({400, 400}, {240, 400}, 0.2);
    test_ui::runFor(2.0);
    EXPECT_THAT(heard(), ElementsAre("start", "stop 2"));
    screen().swipe({400, 400}, {360, 400}, 0.2);
    test_ui::runFor(2.0);
    EXPECT_THAT(heard(), ElementsAre("start", "stop 2"));
    screen().swipe({100, 400}, {350, 400}, 2);
    test_ui::runFor(2.0);
    EXPECT_THAT(heard(), ElementsAre("start", "stop 1"));
}

TEST_F(PageFinger, AShortWayOrASlowOneOfLessThanHalfTheScreenSpringsBack) {
    listenTo(1);
    screen().swipe({600, 700}, {540, 700}, 0.2);
    test_ui::runFor(2.0);
    EXPECT_THAT(heard(), ElementsAre("start", "stop 1"));
    screen().swipe({600, 700}, {300, 700}, 2);
    test_ui::runFor(2.0);
    EXPECT_THAT(heard(), ElementsAre("start", "stop 1"));
}

TEST_F(PageFinger, AFingerThatRestsBeforeItIsLiftedTurnsNoPage) {
    listenTo(1);
    screen().press({600, 700});
    for (const int x : {560, 500, 440, 380}) {
        test_ui::runFor(0.02);
        screen().moveTo({x, 700});
    }
    test_ui::runFor(0.5);
    screen().lift();
    test_ui::runFor(2.0);
    EXPECT_THAT(heard(), ElementsAre("start", "stop 1"));
}

TEST_F(PageFinger, AFingerThatTurnsRoundTurnsNoPage) {
    listenTo(1);
    screen().press({600, 700});
    for (const int x : {560, 480, 400, 320, 240, 180, 240, 320, 400}) {
        test_ui::runFor(0.02);
        screen().moveTo({x, 700});
    }
    screen().lift();
    test_ui::runFor(2.0);
    EXPECT_THAT(heard(), ElementsAre("start", "stop 1"));
}

// What a page holds locks the movement while it takes a finger for itself, as a scroller of its own does.
TEST_F(PageFinger, AFingerThatAPageTakesLeavesTheMovingPagesNotHalfway) {
    listenTo(1);
    swipeLeft();
    test_ui::runFor(0.1);
    screen().press({400, 700});
    Evas_Object* content = pages_[2]->getEvasObj();
    elm_object_scroll_lock_x_set(content, EINA_TRUE);
    screen().lift();
    elm_object_scroll_lock_x_set(content, EINA_FALSE);
    test_ui::runFor(2.0);
    EXPECT_EQ(0, test_ui::geometry(pages_[static_cast<size_t>(pager_->inView())]->getEvasObj()).x);
    const std::string stop = "stop " + std::to_string(pager_->inView());
    EXPECT_THAT(heard(), ElementsAre("start", stop, "start", stop));
    EXPECT_EQ(0, framesInASecond());
}

class PageShownUnderAFinger : public PageMovement {
protected:
    void press() {
        x_ = 600;
        screen().press({x_, 700});
    }
    /// Drags page 1 a little way, or as far as would turn the page.
    void dragTo(int x) {
        while (x_ > x) {
            x_ -= 20;
            test_ui::runFor(0.02);
            screen().moveTo({x_, 700});
        }
    }
    void liftAndRest() {
        screen().lift();
        test_ui::runFor(2.0);
        EXPECT_EQ(0, framesInASecond());
    }
    void expectInView(int index) {
        EXPECT_EQ(index, pager_->inView());
        EXPECT_EQ(0, test_ui::geometry(pages_[static_cast<size_t>(index)]->getEvasObj()).x);
    }

private:
    int x_ = 0;
};

TEST_F(PageShownUnderAFinger, IsThereAtOnceAndWhenTheFingerThatDragsOnIsLifted) {
    for (const int last : {420, 200}) {
        SCOPED_TRACE(last);
        pages_.clear();
        listenTo(1);
        press();
        dragTo(460);
        pager_->showPage(4, false);
        EXPECT_EQ(4, pager_->inView());
        dragTo(last);
        liftAndRest();
        expectInView(4);
        EXPECT_THAT(heard(), ElementsAre("start", "stop 4"));
    }
}

TEST_F(PageShownUnderAFinger, StaysWhenTheFingerRests) {
    listenTo(1);
    press();
    dragTo(300);
    pager_->showPage(3, false);
    test_ui::runFor(1.0);
    expectInView(3);
    liftAndRest();
    expectInView(3);
    EXPECT_THAT(heard(), ElementsAre()) << "it stands there already";
}

TEST_F(PageShownUnderAFinger, StaysWhenTheFingerIsLiftedAtOnce) {
    for (const int from : {460, 200}) {
        SCOPED_TRACE(from);
        pages_.clear();
        listenTo(1);
        press();
        dragTo(from);
        pager_->showPage(3, false);
        liftAndRest();
        expectInView(3);
        EXPECT_THAT(heard(), ElementsAre()) << "it stands there already";
    }
}

TEST_F(PageShownUnderAFinger, StaysWhenTheFingerBeginsToDragOnlyThen) {
    listenTo(1);
    press();
    pager_->showPage(3, false);
    dragTo(200);
    liftAndRest();
    expectInView(3);
    EXPECT_THAT(heard(), ElementsAre("start", "stop 3"));
}

TEST_F(PageShownUnderAFinger, StaysWhenTheScreenTurnsSmallerMeanwhile) {
    listenTo(1);
    press();
    dragTo(460);
    pager_->showPage(4, false);
    dragTo(400);
    evas_object_resize(naviframe_.getEvasObj(), 480, 800);
    test_ui::runFor(0.1);
    liftAndRest();
    expectInView(4);
}

TEST_F(PageShownUnderAFinger, StaysWhenAnotherButtonIsPressed) {
    listenTo(1);
    press();
    dragTo(460);
    pager_->showPage(4, false);
    evas_event_feed_mouse_down(screen().canvas(), 3, EVAS_BUTTON_NONE, test_ui::clock::timestamp(), nullptr);
    evas_event_feed_mouse_up(screen().canvas(), 3, EVAS_BUTTON_NONE, test_ui::clock::timestamp(), nullptr);
    dragTo(200);
    liftAndRest();
    expectInView(4);
}

TEST_F(PageShownUnderAFinger, IsTurnedByTheNextFlick) {
    listenTo(1);
    press();
    dragTo(200);
    pager_->showPage(3, false);
    liftAndRest();
    heard();
    swipeRight();
    test_ui::runFor(2.0);
    EXPECT_THAT(heard(), ElementsAre("start", "stop 2"));
}

}  // namespace
