#include "TipPage.h"

#include <gmock/gmock.h>

using test_ui::geometry;
using testing::ElementsAre;
using testing::IsEmpty;

namespace {

/// A pager where reading begins at the right.
class MirroredPager : public TipPagerTest {
protected:
    MirroredPager() { elm_config_mirrored_set(EINA_TRUE); }

    int xOf(int index) const { return geometry(pages_[static_cast<size_t>(index)]->getEvasObj()).x; }
    Pager* listenTo(int first, int count = 5) {
        pager_ = open(first, count);
        movements_.listenTo(*pager_);
        test_ui::runFor(0.5);
        return pager_;
    }
    void expectInView(int index) const {
        EXPECT_EQ(index, pager_->inView());
        EXPECT_EQ(0, xOf(index));
        if (index > 0) {
            EXPECT_EQ(geometry(pager_->getScroller()).width, xOf(index - 1));
        }
    }

    Pager* pager_ = nullptr;
};

TEST_F(MirroredPager, OpensOnTheChosenPageAndHasTheFirstAtTheRight) {
    for (const bool onTop : {true, false}) {
        for (const int first : {0, 7, 14}) {
            pages_.clear();
            naviframe_.push(new TellingView("list", story_), nullptr, nullptr);
            test_ui::runFor(0.5);
            pager_ = open(first, 15, onTop);
            EXPECT_EQ(first, pager_->inView());
            test_ui::runFor(0.5);
            expectInView(first);
            EXPECT_EQ(first == 0 ? 0 : 720, xOf(0));
            EXPECT_EQ(first == 14 ? 0 : -720, xOf(14));
        }
    }
}

TEST_F(MirroredPager, TurnsByAFlickOfAThirdOfTheScreen) {
    listenTo(1);
    screen().swipe({120, 700}, {360, 700}, 0.2);
    test_ui::runFor(2.0);
    EXPECT_THAT(movements_.heard(), ElementsAre("start", "stop 2"));
    screen().swipe({600, 700}, {360, 700}, 0.2);
    test_ui::runFor(2.0);
    EXPECT_THAT(movements_.heard(), ElementsAre("start", "stop 1"));
    expectInView(1);
}

TEST_F(MirroredPager, KeepsThePageThatIsShownUnderAFinger) {
    listenTo(1);
    screen().press({100, 700});
    for (const int x : {150, 200, 250, 300, 350, 400}) {
        test_ui::runFor(0.02);
        screen().moveTo({x, 700});
        if (x == 250)
            pager_->showPage(4, false);
    }
    screen().lift();
    test_ui::runFor(2.0);
    expectInView(4);
}

TEST_F(MirroredPager, TurnsToTheNextPageByASwipeToTheRight) {
    listenTo(0);
    for (const int page : {1, 2, 3, 4}) {
        swipeRight();
        test_ui::runFor(1.0);
        EXPECT_THAT(heard(), ElementsAre("start", "stop " + std::to_string(page)));
        expectInView(page);
    }
    swipeLeft();
    test_ui::runFor(1.0);
    EXPECT_THAT(heard(), ElementsAre("start", "stop 3"));
    expectInView(3);
}

TEST_F(MirroredPager, OfOnePageBouncesBothWaysAndComesToRest) {
    listenTo(0, 1);
    for (const int way : {0, 1}) {
        way ? swipeLeft() : swipeRight();
        EXPECT_NE(0, test_ui::geometry(pages_[0]->getEvasObj()).x);
        test_ui::runFor(1.0);
        EXPECT_THAT(heard(), ElementsAre("start", "stop 0"));
        EXPECT_EQ(0, test_ui::geometry(pages_[0]->getEvasObj()).x);
    }
    EXPECT_FALSE(test_ui::clock::isAnimating());
}

TEST_F(MirroredPager, BouncesAtBothEndsAndComesToRest) {
    listenTo(0);
    swipeLeft();
    test_ui::runFor(1.0);
    EXPECT_THAT(heard(), ElementsAre("start", "stop 0"));
    pager_->showPage(4, false);
    swipeRight();
    test_ui::runFor(1.0);
    EXPECT_THAT(heard(), ElementsAre("start", "stop 4"));
    expectInView(4);
    EXPECT_FALSE(test_ui::clock::isAnimating());
}

TEST_F(MirroredPager, ShowsAndBringsInThePageThatItIsTold) {
    listenTo(2);
    for (const int page : {0, 4, 1, 3}) {
        pager_->showPage(page, false);
        test_ui::runFor(0.1);
        expectInView(page);
    }
    EXPECT_THAT(heard(), IsEmpty());
    for (const int page : {0, 4, 1, 3}) {
        test_ui::inMainLoop([&] { elm_scroller_page_bring_in(pager_->getScroller(), page, 0); });
        test_ui::runFor(1.0);
        EXPECT_THAT(heard(), ElementsAre("start", "stop " + std::to_string(page)));
        expectInView(page);
    }
}

TEST_F(MirroredPager, KeepsItsPageWhenItsSizeChanges) {
    listenTo(1, 15);
    for (const int width : {480, 1280, 720}) {
        evas_object_resize(naviframe_.getEvasObj(), width, 1000);
        test_ui::runFor(0.5);
        expectInView(1);
    }
    EXPECT_THAT(heard(), IsEmpty());
}

TEST_F(MirroredPager, KeepsItsPageWhenReadingTurnsRound) {
    listenTo(1);
    elm_config_mirrored_set(EINA_FALSE);
    test_ui::runFor(0.5);
    EXPECT_EQ(1, pager_->inView());
    EXPECT_EQ(0, xOf(1));
    EXPECT_EQ(-720, xOf(0));
    elm_config_mirrored_set(EINA_TRUE);
    test_ui::runFor(0.5);
    expectInView(1);
    EXPECT_THAT(heard(), IsEmpty());
}

/// A sequence of pictures that a page plays, where reading begins at the right.
class MirroredPictures : public MirroredPager {
protected:
    MirroredPictures() {
        pager_ = openTips(2);
        test_ui::runFor(1.0);
    }
    void bringIn(int picture) {
        test_ui::inMainLoop([&] { elm_scroller_page_bring_in(tip(2).pictures, picture, 0); });
        test_ui::runFor(1.0);
    }
    void show(int picture) {
        test_ui::inMainLoop([&] { elm_scroller_page_show(tip(2).pictures, picture, 0); });
        test_ui::runFor(0.1);
    }
    void expectPicture(int picture) {
        EXPECT_EQ(picture, tip(2).pictureInView());
        EXPECT_EQ(geometry(tip(2).pictures).x, geometry(tip(2).pages[static_cast<size_t>(picture)]).x);
    }
};

TEST_F(MirroredPictures, PlayInTheirOrderAndBeginAnew) {
    expectPicture(0);
    for (const int picture : {1, 2, 3, 4, 0}) {
        bringIn(picture);
        expectPicture(picture);
    }
    bringIn(3);
    show(0);
    expectPicture(0);
}

TEST_F(MirroredPictures, StayWhereTheyAreWhenAnotherOneComes) {
    for (const int picture : {1, 1, 0, 0, 3, 3}) {
        test_ui::inMainLoop([&] {
            elm_scroller_page_show(tip(2).pictures, picture, 0);
            tip(2).addPicture();
        });
        test_ui::runFor(0.5);
        expectPicture(picture);
    }
}

TEST_F(MirroredPictures, BeginWithTheFirstOneThatWasShownBeforeTheyAreLaidOut) {
    TipPage filledLate("late", story_);
    test_ui::inMainLoop([&] {
        ASSERT_TRUE(filledLate.create(naviframe_.getEvasObj(), nullptr));
        evas_object_resize(filledLate.getEvasObj(), 720, 1280);
        evas_object_show(filledLate.getEvasObj());
        filledLate.fill();
        elm_scroller_page_show(filledLate.pictures, 0, 0);
    });
    test_ui::runFor(0.5);
    EXPECT_EQ(0, filledLate.pictureInView());
    EXPECT_EQ(geometry(filledLate.pictures).x, geometry(filledLate.pages[0]).x);
}

TEST_F(MirroredPictures, StayInOrderWhenReadingTurnsRound) {
    show(1);
    for (const bool mirrored : {false, true, false}) {
        elm_config_mirrored_set(mirrored);
        test_ui::runFor(0.5);
        expectPicture(1);
    }
}

TEST_F(MirroredPictures, TakeASwipeThatTurnsThePageAndDoNotMove) {
    screen().swipe({100, 400}, {600, 400});
    test_ui::runFor(1.0);
    EXPECT_THAT(heard(), ElementsAre("start", "stop 3"));
    screen().swipe({600, 400}, {100, 400});
    test_ui::runFor(1.0);
    EXPECT_THAT(heard(), ElementsAre("start", "stop 2"));
    expectPicture(0);
}

}  // namespace
