#include "PagerTest.h"

using testing::Contains;
using testing::ElementsAre;
using testing::IsEmpty;

/// A finger turns the pages, or a request does.
class Swipe : public PagerTest {
protected:
    Swipe() { writeTips({tip("none.png", "A"), tip("none.png", "B"), tip("none.png", "C")}); }

    /// Opens the pager and waits until all pages are filled and nothing moves.
    void openAtRest(int menu = 0) {
        open(menu);
        test_ui::runFor(2);
        newLog();
        calls::forget();
    }
    static kest_log::Line hit(const std::string& function) { return kest_log::hit(pager_log::file, function); }
    static kest_log::Line display() { return kest_log::begin(pager_log::pageFile, "onViewDisplay"); }
    static kest_log::Line info(const std::string& message) {
        return kest_log::info(pager_log::file, "showContentsPage", message);
    }
};

TEST_F(Swipe, ShowsTheNextPageAndItsNumber) {
    openAtRest();
    swipe();
    test_ui::runFor(1);
    EXPECT_EQ(pageInView(), 1);
    EXPECT_EQ(test_ui::geometry(page(1)).x, 0);
    EXPECT_EQ(title(), "Tips 2/3");
}

TEST_F(Swipe, LeavesItsLines) {
    openAtRest();
    swipe();
    test_ui::runFor(2);
    EXPECT_THAT(newLog(), ElementsAre(hit("__pageScrollStartCb"), hit("__pageScrollStopCb"), display()));
}

TEST_F(Swipe, DisplaysThePageWhenItHasComeToRest) {
    openAtRest();
    swipe();
    test_ui::runFor(0.3);
    EXPECT_EQ(title(), "Tips 1/3");
    EXPECT_THAT(calls::story(1), IsEmpty());
    test_ui::runFor(0.5);
    EXPECT_EQ(title(), "Tips 2/3");
    EXPECT_THAT(calls::story(1), ElementsAre("0.7 info show"));
}

TEST_F(Swipe, ThatARequestInterruptsDisplaysTheRequestedPageLast) {
    openAtRest();
    swipe();
    test_ui::runFor(0.1);
    test_ui::inMainLoop([&] { pager().showContentsPage(2); });
    test_ui::runFor(1);
    EXPECT_EQ(pageInView(), 2);
    EXPECT_EQ(title(), "Tips 3/3");
}

TEST_F(Swipe, GoesToTheLastPageAndBack) {
    openAtRest();
    std::vector<std::string> titles;
    for (const int step : {1, 1, -1, -1}) {
        swipe(step);
        test_ui::runFor(1);
        titles.push_back(title());
    }
    EXPECT_THAT(titles, ElementsAre("Tips 2/3", "Tips 3/3", "Tips 2/3", "Tips 1/3"));
}

TEST_F(Swipe, BeyondTheLastPageBouncesAndDisplaysItAgainOnce) {
    openAtRest(2);
    swipe();
    test_ui::runFor(5);
    EXPECT_EQ(pageInView(), 2);
    EXPECT_EQ(title(), "Tips 3/3");
    EXPECT_THAT(newLog(), ElementsAre(hit("__pageScrollStartCb"), hit("__pageScrollStopCb"), display()));
}

TEST_F(Swipe, BeforeTheFirstPageBouncesAndDisplaysItAgainOnce) {
    openAtRest(0);
    swipe(-1);
    test_ui::runFor(5);
    EXPECT_EQ(pageInView(), 0);
    EXPECT_THAT(newLog(), ElementsAre(hit("__pageScrollStartCb"), hit("__pageScrollStopCb"), display()));
}

TEST_F(Swipe, OfAPagerWithOnePageBouncesAndDisplaysItAgainOnce) {
    writeTips({tip("none.png", "A")});
    openAtRest();
    const test_ui::Point middle = test_ui::geometry(video()).middle();
    for (const int way : {-1, 1}) {
        screen().press(middle);
        for (int step = 1; step <= 5; ++step) {
            test_ui::runFor(0.02);
            screen().moveTo({middle.x + way * 50 * step, middle.y});
        }
        test_ui::runFor(0.02);
        EXPECT_GT(way * test_ui::geometry(page()).x, 20);
        screen().lift();
        test_ui::runFor(2);
        EXPECT_EQ(test_ui::geometry(page()).x, 0);
        EXPECT_EQ(title(), "Tips 1/1");
        EXPECT_THAT(newLog(), ElementsAre(hit("__pageScrollStartCb"), hit("__pageScrollStopCb"), display()));
    }
}

TEST_F(Swipe, ThatIsTooShortDisplaysThePageAgain) {
    openAtRest();
    const test_ui::Point from = test_ui::geometry(video()).middle();
    screen().swipe(from, {from.x - 100, from.y}, 0.8);
    test_ui::runFor(2);
    EXPECT_EQ(pageInView(), 0);
    EXPECT_THAT(newLog(), ElementsAre(hit("__pageScrollStartCb"), hit("__pageScrollStopCb"), display()));
}

TEST_F(Swipe, StopsThePicturesOfEveryPage) {
    drawSequence(2, {0});
    writeTips({tip("a_01.png"), tip("a_01.png"), tip("a_01.png")});
    openAtRest(1);
    swipe();
    for (const int index : {0, 1, 2})
        EXPECT_THAT(calls::story(index), ElementsAre("0.2 pictures at page 0", "0.2 picture 0 touch,hide")) << index;
}

TEST_F(Swipe, StopsThePagesInTheirOrder) {
    drawSequence(2, {0});
    writeTips({tip("a_01.png"), tip("a_01.png"), tip("a_01.png")});
    openAtRest(1);
    swipe();
    EXPECT_THAT(calls::wholeStory(), ElementsAre("0.2 page 0: pictures at page 0", "0.2 page 0: picture 0 touch,hide",
                                                 "0.2 page 1: pictures at page 0", "0.2 page 1: picture 0 touch,hide",
                                                 "0.2 page 2: pictures at page 0", "0.2 page 2: picture 0 touch,hide",
                                                 "0.2 page -1: pages to page 2"));
}

TEST_F(Swipe, PlaysThePageThatItComesTo) {
    drawSequence(2, {0});
    writeTips({tip("none.png"), tip("a_01.png")});
    openAtRest();
    swipe();
    test_ui::runFor(10);
    EXPECT_THAT(calls::story(1),
                ElementsAre("0.2 pictures at page 0", "0.2 picture 0 touch,hide", "0.7 pictures at page 0",
                            "0.7 area reply,uppressed", "0.7 info show", "0.7 picture 0 touch,hide",
                            "0.7 area reply,hide", "1.7 picture 0 touch,show", "3.7 pictures to page 1",
                            "5.7 pictures to page 0", "5.7 picture 0 touch,hide", "5.7 area reply,show"));
}

TEST_F(Swipe, LeavesTheChosenPageTheChosenOne) {
    openAtRest(0);
    swipe();
    test_ui::runFor(1);
    swipe();
    test_ui::runFor(1);
    ASSERT_EQ(pageInView(), 2);
    // Whatever is done with the chosen page is done with the one that was opened.
    test_ui::inMainLoop([&] { pager().onPushed(pager().getNaviItem()); });
    test_ui::runFor(1);
    EXPECT_EQ(pageInView(), 0);
    EXPECT_EQ(title(), "Tips 1/3");
    EXPECT_EQ(pager().getPageCount(), 3);
}

using Request = Swipe;

TEST_F(Request, ShowsItsPageAtOnce) {
    openAtRest();
    test_ui::inMainLoop([&] { pager().showContentsPage(2); });
    EXPECT_EQ(pageInView(), 2);
    EXPECT_EQ(title(), "Tips 3/3");
    EXPECT_THAT(newLog(), ElementsAre(hit("showContentsPage"), info("change view page to 2"), display()));
    EXPECT_THAT(calls::story(-1), ElementsAre("0.0 pages at page 2"));
}

TEST_F(Request, MakesItsPageTheChosenOne) {
    openAtRest();
    test_ui::inMainLoop([&] { pager().showContentsPage(2); });
    swipe(-1);
    test_ui::runFor(1);
    ASSERT_EQ(pageInView(), 1);
    test_ui::inMainLoop([&] { pager().onPushed(pager().getNaviItem()); });
    test_ui::runFor(1);
    EXPECT_EQ(pageInView(), 2);
}

TEST_F(Request, PlaysItsPage) {
    drawSequence(2);
    writeTips({tip("none.png"), tip("a_01.png")});
    openAtRest();
    test_ui::inMainLoop([&] { pager().showContentsPage(1); });
    test_ui::runFor(10);
    EXPECT_THAT(calls::story(1), Contains("4.0 area reply,show"));
}

TEST_F(Request, ForThePageInViewDisplaysItAgain) {
    openAtRest(1);
    test_ui::inMainLoop([&] { pager().showContentsPage(1); });
    EXPECT_EQ(pageInView(), 1);
    EXPECT_THAT(newLog(), ElementsAre(hit("showContentsPage"), info("change view page to 1"), display()));
}

TEST_F(Request, ForAPageThatIsNotThereShowsNoOther) {
    openAtRest(1);
    for (const int index : {3, 15, 1000000, -1, -1000000})
        test_ui::inMainLoop([&] { pager().showContentsPage(index); });
    test_ui::runFor(1);
    EXPECT_EQ(pageInView(), 1);
    EXPECT_EQ(title(), "Tips 2/3");
    EXPECT_THAT(newErrors(), IsEmpty());
}
