#include "TipPage.h"

#include <gmock/gmock.h>

using test_ui::geometry;
using test_ui::Point;
using testing::ElementsAre;
using testing::IsEmpty;

namespace {

class TipText : public TipPagerTest {
protected:
    /// Swipes over the text of the page in view.
    void swipeOverText(Point from, Point to, double seconds = 0.15) { screen().swipe(from, to, seconds); }
    int textScrolledTo(int index) {
        int y = 0;
        elm_scroller_region_get(tip(index).info, nullptr, &y, nullptr, nullptr);
        return y;
    }
    Point linkOf(int index) {
        // The link stands at the text's end.
        int height = 0;
        elm_scroller_child_size_get(tip(index).info, nullptr, &height);
        elm_scroller_region_show(tip(index).info, 0, height - 1, 1, 1);
        test_ui::runFor(0.1);
        return test_ui::link(tip(index).entry, "more").middle();
    }
};

TEST_F(TipText, OfAllPagesComesLateAndMovesNothing) {
    TipPager* pager = openTips(2);
    test_ui::runFor(2.0);
    for (TipPage* each : tips_)
        EXPECT_NE(nullptr, each->entry);
    EXPECT_EQ(2, pager->inView());
    EXPECT_THAT(heard(), IsEmpty());
}

TEST_F(TipText, ThatChangesOnEveryPageMovesNothing) {
    TipPager* pager = openTips(2);
    test_ui::runFor(1.0);
    const auto change = [&](const char* text) {
        test_ui::inMainLoop([&] {
            for (TipPage* each : tips_)
                each->setText(text);
        });
        test_ui::runFor(1.0);
        EXPECT_THAT(heard(), IsEmpty());
    };
    change("Another tip.");
    screen().tap({300, 900});
    swipeLeft();
    test_ui::runFor(1.0);
    EXPECT_THAT(heard(), ElementsAre("start", "stop 3"));
    change("The third.");
    EXPECT_EQ(3, pager->inView());
}

TEST_F(TipText, TakesASwipeThatTurnsThePage) {
    openTips(2);
    test_ui::runFor(1.0);
    for (const double seconds : {0.06, 0.15, 0.6}) {
        swipeOverText({650, 900}, {100, 900}, seconds);
        test_ui::runFor(1.0);
        EXPECT_THAT(heard(), ElementsAre("start", "stop 3")) << seconds;
        swipeOverText({100, 1000}, {650, 1000}, seconds);
        test_ui::runFor(1.0);
        EXPECT_THAT(heard(), ElementsAre("start", "stop 2")) << seconds;
    }
}

TEST_F(TipText, ScrollsOnWhenAFlickWasLiftedAndEndsOnce) {
    openTips(2);
    test_ui::runFor(1.0);
    int starts = 0, stops = 0;
    evas_object_smart_callback_add(
        tip(2).info, "scroll,anim,start", [](void* data, Evas_Object*, void*) { ++*static_cast<int*>(data); }, &starts);
    evas_object_smart_callback_add(
        tip(2).info, "scroll,anim,stop", [](void* data, Evas_Object*, void*) { ++*static_cast<int*>(data); }, &stops);
    swipeOverText({300, 1200}, {300, 800});
    const int lifted = textScrolledTo(2);
    test_ui::runFor(3.0);
    EXPECT_GT(textScrolledTo(2), lifted + 50);
    EXPECT_EQ(1, starts);
    EXPECT_EQ(1, stops);
    EXPECT_THAT(heard(), IsEmpty());
}

TEST_F(TipText, HasALinkThatATapOpensAlsoOneThatSlips) {
    openTips(2);
    test_ui::runFor(1.0);
    const Point link = linkOf(2);
    screen().tap(link);
    EXPECT_EQ(1, tip(2).clicks);
    screen().swipe(link, {link.x + 10, link.y}, 0.1);
    test_ui::runFor(0.1);
    EXPECT_EQ(2, tip(2).clicks);
    screen().swipe(link, {link.x, link.y - 10}, 0.1);
    test_ui::runFor(0.1);
    EXPECT_EQ(3, tip(2).clicks);
}

TEST_F(TipText, HasALinkThatASwipeFromItDoesNotOpenButATapAfterwardsDoes) {
    openTips(2);
    test_ui::runFor(1.0);
    const Point link = linkOf(2);
    swipeOverText(link, {link.x > 360 ? link.x - 350 : link.x + 350, link.y});
    test_ui::runFor(1.0);
    EXPECT_EQ(0, tip(2).clicks);
    EXPECT_THAT(heard(), ElementsAre("start", link.x > 360 ? "stop 3" : "stop 1"));
    swipeOverText({360, 700}, {link.x > 360 ? 700 : 20, 700});
    test_ui::runFor(1.0);
    screen().tap(linkOf(2));
    EXPECT_EQ(1, tip(2).clicks);
}

class TipPictures : public TipPagerTest, public testing::WithParamInterface<TipPage::Pictures> {
protected:
    int picturesAt() {
        int x = 0, y = 0;
        elm_scroller_region_get(tip(2).pictures, &x, &y, nullptr, nullptr);
        return x + y;
    }
    /// Moves the pictures as a page that demonstrates itself does; it takes half a second.
    void moveOn() {
        test_ui::inMainLoop([this] {
            if (GetParam() == TipPage::Pictures::Sequence)
                elm_scroller_page_bring_in(tip(2).pictures, 1, 0);
            else
                elm_scroller_region_bring_in(tip(2).pictures, 0, 600, 716, 655);
        });
    }
};

TEST_P(TipPictures, TakeASwipeThatTurnsThePageAndStayWhereTheyAre) {
    openTips(2, 5, GetParam());
    test_ui::runFor(1.0);
    for (const double seconds : {0.06, 0.15, 0.6}) {
        screen().swipe({600, 400}, {100, 400}, seconds);
        test_ui::runFor(1.0);
        EXPECT_THAT(heard(), ElementsAre("start", "stop 3")) << seconds;
        screen().swipe({100, 400}, {600, 400}, seconds);
        test_ui::runFor(1.0);
        EXPECT_THAT(heard(), ElementsAre("start", "stop 2")) << seconds;
    }
    EXPECT_EQ(0, picturesAt());
}

TEST_P(TipPictures, AreNotDraggedByASwipeWhileTheyMove) {
    openTips(2, 5, GetParam());
    test_ui::runFor(1.0);
    moveOn();
    test_ui::runFor(0.2);
    const int touched = picturesAt();
    EXPECT_GT(touched, 0);
    screen().swipe({600, 400}, {100, 400});
    test_ui::runFor(1.0);
    EXPECT_THAT(heard(), ElementsAre("start", "stop 3"));
    // A picture comes to lie in its frame; a tall one stays where the finger held it.
    EXPECT_EQ(GetParam() == TipPage::Pictures::Sequence ? 716 : touched, picturesAt());
}

TEST_P(TipPictures, AreNotMovedByAFingerUpOrDown) {
    openTips(2, 5, GetParam());
    test_ui::runFor(1.0);
    screen().swipe({300, 600}, {300, 200});
    test_ui::runFor(1.0);
    EXPECT_EQ(0, picturesAt());
    EXPECT_THAT(heard(), IsEmpty());
}

INSTANTIATE_TEST_SUITE_P(Kinds, TipPictures, testing::Values(TipPage::Pictures::Sequence, TipPage::Pictures::Tall),
                         [](const auto& kind) {
                             return kind.param == TipPage::Pictures::Sequence ? "Sequence" : "Tall";
                         });

class TipButton : public TipPagerTest {};

TEST_F(TipButton, OnThePicturesIsPressedByATapAndPassesASwipeOn) {
    openTips(2);
    test_ui::runFor(1.0);
    const Point button = geometry(tip(2).button).middle();
    screen().tap(button);
    EXPECT_EQ(1, tip(2).presses);
    screen().swipe(button, {button.x - 350, button.y}, 0.1);
    test_ui::runFor(1.0);
    EXPECT_EQ(1, tip(2).presses);
    EXPECT_THAT(heard(), ElementsAre("start", "stop 3"));
    EXPECT_EQ(0, tip(2).pictureInView());
}

}  // namespace
