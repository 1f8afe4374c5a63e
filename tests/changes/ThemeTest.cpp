#include "States.h"

using testing::IsEmpty;

namespace {

constexpr unsigned int lightGround = 0xF7F8FA;
constexpr unsigned int darkGround = 0x0E1116;

}  // namespace

/// The theme changes: every colour does, and nothing else. A pager stays open, where it was.
class ThemeChange : public ChangeTest {
protected:
    /// Of the header, and of the list below it.
    std::vector<unsigned int> grounds() {
        std::vector<unsigned int> colours = {ground(10)};
        if (topView() == "KestMainView")
            colours.push_back(ground(1200));
        return colours;
    }
};

INSTANTIATE_TEST_SUITE_P(Changes, ThemeChange, testing::ValuesIn(ChangeTest::cellsWhereNothingMoves()),
                         ChangeTest::nameOfCell);

TEST_P(ThemeChange, IsSeenEverywhere) {
    reachState();
    for (const unsigned int colour : grounds())
        ASSERT_EQ(colour, lightGround);
    setTheme("dark");
    comeToRest();
    EXPECT_EQ(top(), GetParam().top);
    for (const unsigned int colour : grounds())
        EXPECT_EQ(colour, darkGround);
    expectToWork(tips::atFirst(), Language::English);
    for (const unsigned int colour : grounds())
        EXPECT_EQ(colour, darkGround);
    EXPECT_THAT(newErrors(), IsEmpty());
}

/// Pictures that play when something changes that leaves their page open.
class PlayingPictures : public ChangesTest {
protected:
    void play() {
        begin();
        tapRow(1);
        test_ui::runFor(4);
        ASSERT_EQ(pictureInView(), 1);
    }
    void expectToPlayOn() {
        EXPECT_TRUE(test_ui::runUntil([&] { return pictureInView() == 2; }, 8));
        EXPECT_TRUE(test_ui::runUntil([&] { return pictureInView() == 0; }, 4));
        newRecords();
        reply();
        EXPECT_THAT(newRecords(), testing::ElementsAre("KT02"));
        EXPECT_TRUE(test_ui::runUntil([&] { return pictureInView() == 1; }, 4));
    }
};

TEST_F(PlayingPictures, StartOverAtAChangeOfTheTheme) {
    play();
    setTheme("dark");
    test_ui::runFor(0.1);
    EXPECT_EQ(pictureInView(), 0);
    expectToPlayOn();
}

TEST_F(PlayingPictures, PlayOnAtAnUpdate) {
    play();
    update("com.example.music");
    test_ui::runFor(0.1);
    EXPECT_EQ(pictureInView(), 1);
    expectToPlayOn();
}
