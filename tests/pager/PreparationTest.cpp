#include "PagerTest.h"
#include "TimerCalls.h"

using testing::Contains;
using testing::ElementsAre;
using testing::IsEmpty;
using testing::Not;

/// The chosen page is filled as soon as there is time, the others 0.4 seconds later.
class Preparation : public PagerTest {
protected:
    Preparation() { writeTips({tip("none.png", "A"), tip("none.png", "B"), tip("none.png", "C")}); }

    bool isFilled(int index) { return info(index) != nullptr; }
    std::vector<bool> filled() { return {isFilled(0), isFilled(1), isFilled(2)}; }
    static kest_log::Line loadsOthers() {
        return kest_log::info(pager_log::file, "operator()", "Loading other tabs..");
    }
    static long count(const std::vector<kest_log::Line>& lines, const kest_log::Line& line) {
        return std::count(lines.begin(), lines.end(), line);
    }
};

TEST_F(Preparation, FillsNothingWhileThePagerIsPushed) {
    startEmpty();
    std::vector<bool> before;
    test_ui::inMainLoop([&] {
        Pager* view = new Pager(2, true);
        naviframe().push(view, nullptr, nullptr);
        Eina_List* pages = elm_box_children_get(elm_object_content_get(view->getScroller()));
        const Eina_List* node = nullptr;
        void* each = nullptr;
        EINA_LIST_FOREACH(pages, node, each)
        before.push_back(elm_object_part_content_get(static_cast<Evas_Object*>(each), "info") != nullptr);
        eina_list_free(pages);
    });
    EXPECT_THAT(before, ElementsAre(false, false, false));
}

TEST_F(Preparation, FillsTheChosenPageFirst) {
    open(1);
    EXPECT_THAT(filled(), ElementsAre(false, true, false));
}

TEST_F(Preparation, FillsTheOthersAfterFourTenthsOfASecond) {
    open(1);
    test_ui::runFor(0.35);
    EXPECT_THAT(filled(), ElementsAre(false, true, false));
    EXPECT_THAT(newLog(), Not(Contains(loadsOthers())));
    test_ui::runFor(0.1);
    EXPECT_THAT(filled(), ElementsAre(true, true, true));
    EXPECT_THAT(newLog(), Contains(loadsOthers()));
}

TEST_F(Preparation, FillsOneOfTheOthersAtATime) {
    open(1);
    std::vector<std::vector<bool>> steps;
    calls::afterIdler = [&] { steps.push_back(filled()); };
    test_ui::runFor(0.5);
    calls::afterIdler = nullptr;
    EXPECT_THAT(steps, ElementsAre(ElementsAre(true, true, false), ElementsAre(true, true, false),
                                   ElementsAre(true, true, true)));
}

TEST_F(Preparation, ShowsThePageThatItFills) {
    push(0, true, [this](Pager&) { evas_object_hide(page(1)); });
    test_ui::runFor(0.35);
    ASSERT_FALSE(evas_object_visible_get(page(1)));
    test_ui::runFor(0.1);
    EXPECT_TRUE(isFilled(1));
    EXPECT_TRUE(evas_object_visible_get(page(1)));
}

TEST_F(Preparation, FillsEachPageOnce) {
    open();
    test_ui::runFor(10);
    const auto lines = newLog();
    EXPECT_EQ(count(lines, loadsOthers()), 1);
    EXPECT_EQ(count(lines, kest_log::begin(pager_log::pageFile, "__fillLayout")), 3);
}

TEST_F(Preparation, DisplaysTheChosenPageOnce) {
    open();
    test_ui::runFor(10);
    EXPECT_EQ(count(newLog(), kest_log::begin(pager_log::pageFile, "onViewDisplay")), 1);
    EXPECT_EQ(calls::steps({"title"}), (std::vector<std::string>{"title elm.text.title kest Tips 1/3"}));
}

TEST_F(Preparation, ShowsAPageThatASwipeReachedBefore) {
    open();
    swipe();
    EXPECT_THAT(filled(), ElementsAre(true, false, false));
    test_ui::runFor(1);
    EXPECT_EQ(pageInView(), 1);
    EXPECT_EQ(test_ui::plainText(entry(1)), "B");
    EXPECT_EQ(title(), "Tips 2/3");
}

TEST_F(Preparation, PlaysAPageThatASwipeReachedBefore) {
    drawSequence(2);
    writeTips({tip("none.png"), tip("a_01.png")});
    open();
    swipe();
    test_ui::runFor(10);
    EXPECT_THAT(calls::story(1), Contains(testing::EndsWith("area reply,show")));
}

TEST_F(Preparation, PlaysAPageThatARequestReachedBefore) {
    drawSequence(2);
    writeTips({tip("none.png"), tip("a_01.png")});
    open();
    test_ui::inMainLoop([&] { pager().showContentsPage(1); });
    ASSERT_FALSE(isFilled(1));
    test_ui::runFor(10);
    EXPECT_THAT(calls::story(1),
                ElementsAre("0.4 pictures to page 0", "0.4 pictures at page 0", "0.4 area reply,uppressed",
                            "0.4 info show", "0.4 picture 0 touch,hide", "0.4 area reply,hide",
                            "0.4 picture 0 touch,hide", "2.4 pictures to page 1", "4.4 pictures to page 0",
                            "4.4 picture 0 touch,hide", "4.4 area reply,show"));
    EXPECT_EQ(calls::steps({"title"}),
              (std::vector<std::string>{"title elm.text.title kest Tips 1/2", "title elm.text.title kest Tips 2/2",
                                        "title elm.text.title kest Tips 2/2"}));
}

TEST_F(Preparation, DoesNotPlayAPageThatARequestLeft) {
    drawSequence(2);
    writeTips({tip("none.png"), tip("a_01.png")});
    open();
    test_ui::inMainLoop([&] { pager().showContentsPage(1); });
    test_ui::inMainLoop([&] { pager().showContentsPage(0); });
    test_ui::runFor(10);
    EXPECT_THAT(calls::story(1), ElementsAre("0.4 pictures to page 0"));
    EXPECT_EQ(title(), "Tips 1/2");
}

TEST_F(Preparation, DoesNotPlayAPageThatASwipeIsLeaving) {
    drawSequence(2);
    writeTips({tip("none.png"), tip("a_01.png")});
    open();
    test_ui::inMainLoop([&] { pager().showContentsPage(1); });
    const test_ui::Point middle = test_ui::geometry(page(1)).middle();
    screen().swipe({middle.x - 260, middle.y}, {middle.x + 260, middle.y}, 0.2);
    ASSERT_FALSE(isFilled(1));
    test_ui::runFor(10);
    ASSERT_EQ(pageInView(), 0);
    EXPECT_THAT(calls::story(1), ElementsAre("0.4 pictures to page 0"));
}

TEST_F(Preparation, FillsThePageThatARequestChoseBeforeItWasIdle) {
    drawSequence(2);
    writeTips({tip("none.png", "A"), tip("none.png", "B"), tip("a_01.png", "C")});
    push(0, true, [](Pager& view) { view.showContentsPage(2); });
    test_ui::runFor(0.3);
    EXPECT_THAT(filled(), ElementsAre(false, false, true));
    EXPECT_EQ(pageInView(), 2);
    EXPECT_EQ(title(), "Tips 3/3");
    EXPECT_THAT(calls::story(2), Contains("0.0 area reply,uppressed"));
    test_ui::runFor(5);
    EXPECT_THAT(calls::story(2), Contains("4.0 area reply,show"));
}

TEST_F(Preparation, TitlesAPageThatARequestShowedBefore) {
    open();
    test_ui::inMainLoop([&] { pager().showContentsPage(2); });
    EXPECT_EQ(title(), "Tips 3/3");
    settle();
    EXPECT_EQ(test_ui::plainText(entry(2)), "C");
}

TEST_F(Preparation, EndsWithThePagerBeforeItIsIdle) {
    startEmpty();
    naviframe().push(new OtherView, nullptr, nullptr);
    settle();
    test_ui::inMainLoop([&] {
        naviframe().push(new Pager(2, false), nullptr, nullptr);
        newLog();
        elm_object_item_del(elm_naviframe_top_item_get(naviframe().getEvasObj()));
    });
    test_ui::runFor(2);
    EXPECT_EQ(topView(), "OtherView");
    EXPECT_THAT(newLog(), Not(Contains(kest_log::begin(pager_log::pageFile, "onViewPrepare"))));
}

TEST_F(Preparation, EndsWithThePagerBeforeTheOthersAreFilled) {
    startEmpty();
    naviframe().push(new OtherView, nullptr, nullptr);
    settle();
    open();
    test_ui::runFor(0.25);
    test_ui::inMainLoop([&] { elm_object_item_del(pager().getNaviItem()); });
    newLog();
    test_ui::runFor(2);
    EXPECT_EQ(topView(), "OtherView");
    EXPECT_THAT(newLog(), IsEmpty());
}
