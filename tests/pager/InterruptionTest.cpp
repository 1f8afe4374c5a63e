#include "PagerTest.h"

#include <device/Keys.h>

using testing::Contains;
using testing::ElementsAre;
using testing::IsEmpty;
using testing::IsSupersetOf;

namespace {

/// How a sequence of three pictures begins whose first two have markers.
std::vector<std::string> beginning() {
    return {"0.0 pictures at page 0",   "0.0 area reply,uppressed", "0.0 info show",
            "0.0 picture 0 touch,hide", "0.0 picture 1 touch,hide", "0.0 area reply,hide"};
}

}  // namespace

/// What comes between while pictures play. The parameter is when: while a marker is awaited, while it is shown, while
/// the next picture comes, while the last one is shown.
class Interruption : public PagerTest, public testing::WithParamInterface<double> {
protected:
    /// Opens a page whose three pictures, two of them marked, play up to that time; a second page stands beside it.
    void play() {
        drawSequence(3, {0, 1});
        drawPicture("plain.png");
        writeTips({tip("a_01.png"), tip("plain.png")});
        open();
        test_ui::runFor(GetParam());
        calls::forget();
    }
};

INSTANTIATE_TEST_SUITE_P(Playing, Interruption, testing::Values(0.5, 2.0, 3.2, 7.0),
                         [](const auto& when) { return "After" + std::to_string(int(when.param * 10)) + "Tenths"; });

TEST_P(Interruption, ByItsOwnDisplayStartsOver) {
    play();
    test_ui::inMainLoop([&] { pager().showContentsPage(0); });
    EXPECT_EQ(pictureInView(), 0);
    test_ui::runFor(20);
    std::vector<std::string> whole = beginning();
    for (const char* line :
         {"1.0 picture 0 touch,show", "3.0 pictures to page 1", "4.0 picture 1 touch,show", "6.0 pictures to page 2",
          "8.0 pictures to page 0", "8.0 picture 0 touch,hide", "8.0 picture 1 touch,hide", "8.0 area reply,show"})
        whole.emplace_back(line);
    EXPECT_THAT(calls::story(), testing::ElementsAreArray(whole));
}

TEST_P(Interruption, ByASwipePutsThePicturesBackAndStopsThem) {
    play();
    swipe();
    test_ui::runFor(20);
    ASSERT_EQ(pageInView(), 1);
    EXPECT_THAT(calls::story(),
                IsSupersetOf({"0.2 pictures at page 0", "0.2 picture 0 touch,hide", "0.2 picture 1 touch,hide"}));
    EXPECT_EQ(calls::story().back(), "0.2 picture 1 touch,hide");
    EXPECT_EQ(pictureInView(), 0);
}

TEST_P(Interruption, ByASwipeIsNoLineOfThePageThatGoes) {
    play();
    newLog();
    swipe();
    test_ui::runFor(0.05);
    EXPECT_EQ(calls::story().back(), "0.2 picture 1 touch,hide");
    EXPECT_THAT(newLog(), ElementsAre(kest_log::hit(pager_log::file, "__pageScrollStartCb")));
}

TEST_P(Interruption, ByASwipeGivesTheButtonBack) {
    play();
    swipe();
    test_ui::runFor(1);
    calls::forget();
    pressReply();
    EXPECT_THAT(calls::story(), ElementsAre("0.0 record", "0.0 area reply,hide", "0.0 area reply,press,show"));
}

TEST_P(Interruption, ByASwipeThereAndBackStartsOver) {
    play();
    swipe();
    test_ui::runFor(1);
    swipe(-1);
    test_ui::runFor(0.3);
    calls::forget();
    test_ui::runFor(20);
    ASSERT_EQ(pageInView(), 0);
    std::vector<std::string> lines = calls::story();
    ASSERT_GE(lines.size(), 6U);
    lines.resize(6);
    for (std::string& line : lines)
        line = "0.0" + line.substr(3);
    EXPECT_EQ(lines, beginning());
    EXPECT_THAT(calls::story(), Contains(testing::EndsWith("area reply,show")));
}

TEST_P(Interruption, ByTheEndOfThePagerIsFollowedByNothing) {
    drawSequence(3, {0, 1});
    writeTip();
    startEmpty();
    naviframe().push(new OtherView, nullptr, nullptr);
    settle();
    open();
    test_ui::runFor(GetParam());
    test_ui::inMainLoop([&] { closePager(); });
    test_ui::runFor(0.5);
    ASSERT_EQ(topView(), "OtherView");
    calls::forget();
    newLog();
    test_ui::runFor(20);
    EXPECT_THAT(calls::story(), IsEmpty());
    EXPECT_THAT(newLog(), IsEmpty());
}

TEST_P(Interruption, ByTheEndOfTheApplicationIsHarmless) {
    play();
    running_.reset();
    EXPECT_THAT(calls::story(), IsEmpty());
}

TEST_P(Interruption, ByAChangeOfTheThemeStartsOver) {
    play();
    device()->settings().set(device::keys::theme, "dark");
    test_ui::runFor(0.9);
    EXPECT_THAT(calls::story(), testing::ElementsAreArray(beginning()));
}

class PageAskedForUnderAFinger : public PagerTest {};

TEST_F(PageAskedForUnderAFinger, PlaysWhenTheFingerIsLifted) {
    drawSequence(3, {0, 1});
    drawPicture("plain.png");
    writeTips({tip("plain.png"), tip("plain.png"), tip("a_01.png")});
    open();
    test_ui::runFor(1);
    screen().press({600, 400});
    for (int x = 550; x >= 150; x -= 50) {
        test_ui::runFor(0.02);
        screen().moveTo({x, 400});
        if (x == 400)
            test_ui::inMainLoop([this] { pager().showContentsPage(2); });
    }
    screen().lift();
    test_ui::runFor(0.9);
    EXPECT_EQ(pageInView(), 2);
    calls::forget();
    test_ui::runFor(20);
    EXPECT_EQ(pageInView(), 2);
    std::vector<std::string> lines = calls::story(2);
    for (std::string& line : lines)
        line = line.substr(line.find(' ') + 1);
    EXPECT_THAT(lines,
                ElementsAre("picture 0 touch,show", "pictures to page 1", "picture 1 touch,show", "pictures to page 2",
                            "pictures to page 0", "picture 0 touch,hide", "picture 1 touch,hide", "area reply,show"));
}

class InterruptedTallPicture : public PagerTest {
protected:
    /// Opens it, with a page that stands still behind it.
    void play(double seconds) {
        drawPicture("a_01.png", 716, 900);
        drawPicture("plain.png");
        writeTips({tip("a_01.png"), tip("plain.png")});
        open();
        test_ui::runFor(seconds);
    }
};

TEST_F(InterruptedTallPicture, IsScrolledBackByASwipe) {
    play(3);
    ASSERT_EQ(scrolledTo(), 245);
    calls::forget();
    swipe();
    test_ui::runFor(20);
    ASSERT_EQ(pageInView(), 1);
    EXPECT_THAT(calls::story(), ElementsAre("0.2 pictures to y 0"));
    EXPECT_EQ(scrolledTo(), 0);
}

TEST_F(InterruptedTallPicture, AtItsTopStaysThereAtASwipe) {
    play(1);
    calls::forget();
    swipe();
    test_ui::runFor(20);
    ASSERT_EQ(pageInView(), 1);
    EXPECT_THAT(calls::story(), IsEmpty());
}

TEST_F(InterruptedTallPicture, GetsItsButtonBackByASwipe) {
    play(0.5);
    swipe();
    test_ui::runFor(1);
    calls::forget();
    pressReply();
    EXPECT_THAT(calls::story(), ElementsAre("0.0 area reply,hide", "0.0 area reply,press,show"));
}

TEST_F(InterruptedTallPicture, StartsOverWhenASwipeComesBack) {
    play(3);
    swipe();
    test_ui::runFor(1);
    swipe(-1);
    test_ui::runFor(0.3);
    calls::forget();
    test_ui::runFor(20);
    EXPECT_THAT(calls::story(), IsSupersetOf({"0.2 area reply,hide", "2.2 pictures to y 245", "4.2 pictures to y 0",
                                              "4.2 area reply,show"}));
}

using PlainPage = PagerTest;

TEST_F(PlainPage, HasNothingThatPlays) {
    drawPicture("plain.png");
    writeTips({tip("plain.png"), tip("missing.png")});
    open();
    test_ui::runFor(5);
    EXPECT_THAT(calls::story(0), ElementsAre("0.0 info show"));
    EXPECT_THAT(calls::story(1), IsEmpty());
    swipe();
    test_ui::runFor(20);
    ASSERT_EQ(pageInView(), 1);
    EXPECT_THAT(calls::story(0), ElementsAre("0.0 info show"));
    EXPECT_THAT(calls::story(1), ElementsAre(testing::EndsWith("info show")));
}
