#include "PagerTest.h"

#include <device/Keys.h>

using testing::Contains;
using testing::ElementsAre;
using testing::IsEmpty;

/// A page that cannot be made. The log tells of it, and the pager goes on with the others.
class MissingPage : public PagerTest {
protected:
    MissingPage() { writeTips({tip("none.png", "A"), tip("none.png", "B"), tip("none.png", "C")}); }

    /// Pushes the pager at that menu, without the page of the menu `missing`, and waits until all is filled.
    void openWithout(int missing, int menu) {
        startEmpty();
        // The first layout is the pager's own.
        calls::fail("elm_layout_add", missing + 2);
        push(menu);
        test_ui::runFor(1);
    }
    void request(int menu) {
        test_ui::inMainLoop([&] { pager().showContentsPage(menu); });
        test_ui::runFor(0.5);
    }
    /// The texts of the pages that are there, by their places.
    std::vector<std::string> texts() {
        std::vector<std::string> found;
        for (int place = 0; place < pager().getPageCount(); ++place)
            found.push_back(test_ui::plainText(entry(place)));
        return found;
    }
    static kest_log::Line notMade(int menu) {
        return kest_log::error(pager_log::pageFile, "onCreate",
                               "the layout of page " + std::to_string(menu) + " could not be made");
    }
};

TEST_F(MissingPage, IsALineInTheLog) {
    openWithout(1, 0);
    EXPECT_THAT(newErrors(), ElementsAre(notMade(1)));
}

TEST_F(MissingPage, LeavesTheOthersFilledAndTheChosenOneInView) {
    openWithout(1, 2);
    EXPECT_THAT(texts(), ElementsAre("A", "C"));
    EXPECT_EQ(pageInView(), 1);
    EXPECT_EQ(test_ui::geometry(page(1)).x, 0);
    EXPECT_EQ(title(), "Tips 3/3");
}

TEST_F(MissingPage, IsPassedByASwipe) {
    openWithout(1, 0);
    EXPECT_EQ(title(), "Tips 1/3");
    swipe();
    test_ui::runFor(1);
    EXPECT_EQ(pageInView(), 1);
    EXPECT_EQ(title(), "Tips 3/3");
    swipe(-1);
    test_ui::runFor(1);
    EXPECT_EQ(title(), "Tips 1/3");
}

TEST_F(MissingPage, LeavesThePicturesOfTheOthersPlaying) {
    drawSequence(2);
    writeTips({tip("none.png"), tip("none.png"), tip("a_01.png")});
    openWithout(0, 2);
    test_ui::runFor(5);
    EXPECT_THAT(calls::story(1), Contains("4.0 area reply,show"));
    calls::forget();
    swipe(-1);
    EXPECT_THAT(calls::story(1), ElementsAre("0.2 pictures at page 0", "0.2 picture 0 touch,hide"));
}

TEST_F(MissingPage, LetsARequestFindTheOthers) {
    openWithout(0, 1);
    EXPECT_EQ(title(), "Tips 2/3");
    request(2);
    EXPECT_EQ(pageInView(), 1);
    EXPECT_EQ(title(), "Tips 3/3");
}

TEST_F(MissingPage, IsNotShownByARequest) {
    openWithout(1, 0);
    request(1);
    EXPECT_EQ(pageInView(), 0);
    EXPECT_EQ(title(), "Tips 1/3");
}

TEST_F(MissingPage, ThatWasChosenGivesWayToTheNextOne) {
    openWithout(1, 1);
    EXPECT_EQ(pageInView(), 1);
    EXPECT_EQ(title(), "Tips 3/3");
    EXPECT_THAT(newErrors(), ElementsAre(notMade(1)));
}

TEST_F(MissingPage, ThatWasChosenAndTheLastGivesWayToTheFirstOne) {
    openWithout(2, 2);
    EXPECT_EQ(pageInView(), 0);
    EXPECT_EQ(title(), "Tips 1/3");
}

TEST_F(MissingPage, ThatIsTheOnlyOneLeavesAnEmptyPager) {
    writeTips({tip("none.png")});
    openWithout(0, 0);
    const test_ui::Point middle = test_ui::geometry(pager().getScroller()).middle();
    screen().swipe({middle.x + 200, middle.y}, {middle.x - 200, middle.y});
    test_ui::runFor(1);
    EXPECT_EQ(pager().getPageCount(), 0);
    EXPECT_EQ(topView(), "KestContentView");
    EXPECT_THAT(newErrors(), ElementsAre(notMade(0)));
}

TEST_F(MissingPage, HearsOfNoTheme) {
    openWithout(0, 1);
    EXPECT_THAT(calls::steps({"theme"}), ElementsAre("theme +", "theme +"));
    newLog();
    device()->settings().set(device::keys::theme, "dark");
    settle();
    const auto hit = kest_log::hit(pager_log::pageFile, "__themeChangedCb");
    EXPECT_THAT(newLogOf(pager_log::pageFile),
                ElementsAre(hit, kest_log::begin(pager_log::pageFile, "onViewDisplay"), hit));
}

TEST_F(MissingPage, HearsOfNoLanguage) {
    openWithout(0, 1);
    newLog();
    setLanguage("ko_KR.UTF-8");
    test_ui::runFor(1);
    EXPECT_EQ(title(), "3개 중 2");
    EXPECT_THAT(newErrors(), IsEmpty());
}
