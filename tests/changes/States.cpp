#include "States.h"

#include <algorithm>
#include <map>

using testing::ElementsAre;
using testing::IsEmpty;

namespace {

// Places in the list as it is at first.
constexpr std::size_t alarmRow = 1;
constexpr std::size_t snoozeRow = 2;

}  // namespace

std::string nameOf(State state) {
    static const std::map<State, std::string> names = {
        {State::List, "OnTheList"},
        {State::ScrolledList, "OnTheScrolledList"},
        {State::PagerComes, "WhileAPagerComes"},
        {State::PagerAtRest, "OnAPager"},
        {State::PicturesPlay, "WhilePicturesPlay"},
        {State::FingerSwipes, "WhileAFingerSwipes"},
        {State::PagesGlide, "WhilePagesGlide"},
        {State::RequestedPagerComes, "WhileARequestedPagerComes"},
        {State::RequestedPager, "OnARequestedPager"},
        {State::RequestedPagers, "OnRequestedPagers"},
        {State::TurnedPager, "OnAPagerThatARequestTurned"},
        {State::Nothing, "OnNothing"},
    };
    return names.at(state);
}

std::vector<Cell> ChangeTest::cellsWhereNothingMoves() {
    return cellsWhereThePagerCounts("list Tips: Music", "10", "Music");
}

std::vector<Cell> ChangeTest::cellsWhereThePagerCloses() {
    const std::string list = "list Tips: Tips and guidelines";
    return cellsWhereThePagerCloses(list, list, "page Tips 2/10: Alarm, How to use Alarm");
}

std::vector<Cell> ChangeTest::cellsWhereThePagerCloses(const std::string& list, const std::string& scrolledList,
                                                       const std::string& pageBeneath) {
    return {
        {State::List, list},           {State::ScrolledList, scrolledList},
        {State::PagerComes, list},     {State::PagerAtRest, list},
        {State::PicturesPlay, list},   {State::FingerSwipes, list},
        {State::PagesGlide, list},     {State::RequestedPagerComes, list},
        {State::RequestedPager, list}, {State::RequestedPagers, pageBeneath},
        {State::TurnedPager, list},    {State::Nothing, "nothing"},
    };
}

std::vector<Cell> ChangeTest::cellsWhereThePagerCounts(const std::string& scrolledList, const std::string& count,
                                                       const std::string& fourthTitle) {
    const std::string second = "page Tips 2/" + count + ": Alarm, How to use Alarm";
    const std::string third = "page Tips 3/" + count + ": Snooze, How to use Snooze";
    const std::string fourth = "page Tips 4/" + count + ": " + fourthTitle + ", How to use Music";
    return {
        {State::List, "list Tips: Tips and guidelines"},
        {State::ScrolledList, scrolledList},
        {State::PagerComes, second},
        {State::PagerAtRest, third},
        {State::PicturesPlay, second},
        {State::FingerSwipes, fourth},
        {State::PagesGlide, fourth},
        {State::RequestedPagerComes, "page Tips 3/10: Snooze, How to use Snooze"},
        {State::RequestedPager, "page Tips 3/10: Snooze, How to use Snooze"},
        {State::RequestedPagers, "page Tips 3/10: Snooze, How to use Snooze"},
        {State::TurnedPager, "page Tips 4/10: Music, How to use Music"},
        {State::Nothing, "nothing"},
    };
}

void ChangeTest::openRow(std::size_t menu, double seconds) {
    begin();
    tapRow(menu);
    test_ui::runFor(seconds);
    ASSERT_EQ(topView(), "KestContentView");
}

void ChangeTest::reachState() {
    switch (GetParam().state) {
    case State::List:
        begin();
        break;
    case State::ScrolledList:
        begin();
        screen().swipe({300, 1100}, {300, 300}, 0.1);
        test_ui::runFor(2);
        ASSERT_NE(top(), "list Tips: Tips and guidelines");
        break;
    case State::PagerComes:
        openRow(alarmRow, 0.1);
        break;
    case State::PagerAtRest:
        openRow(snoozeRow, 1.5);
        break;
    case State::PicturesPlay:
        openRow(alarmRow, 4);
        ASSERT_EQ(pictureInView(), 1);
        break;
    case State::FingerSwipes:
        openRow(snoozeRow, 1.5);
        screen().press({600, 400});
        for (int x = 550; x >= 150; x -= 50) {
            test_ui::runFor(0.02);
            screen().moveTo({x, 400});
        }
        fingerIsDown_ = true;
        break;
    case State::PagesGlide:
        openRow(snoozeRow, 1.5);
        swipeToTheNextPage();
        test_ui::runFor(0.1);
        break;
    case State::RequestedPagerComes:
        beginAtOnce({"appID=com.example.alarm", "page=2"});
        test_ui::runFor(0.1);
        break;
    case State::RequestedPager:
        begin({"appID=com.example.alarm", "page=2"});
        break;
    case State::RequestedPagers:
        begin({"appID=com.example.alarm"});
        break;
    case State::TurnedPager:
        begin({"appID=com.example.alarm", "page=2"});
        request({{"appID", "com.example.music"}});
        test_ui::runFor(1);
        break;
    case State::Nothing:
        begin({"appID=com.example.nobody"});
        break;
    }
    newRecords();
    EXPECT_THAT(newErrors(), IsEmpty());
}

void ChangeTest::comeToRest() {
    test_ui::runFor(1);
    if (fingerIsDown_)
        screen().lift();
    fingerIsDown_ = false;
    test_ui::runFor(1);
}

void ChangeTest::expectWhatTheCellSays(const Names& names, Language language) {
    comeToRest();
    EXPECT_EQ(top(), GetParam().top);
    expectToWork(names, language);
    EXPECT_THAT(newErrors(), IsEmpty());
}

void ChangeTest::expectToWork(const Names& names, Language language) {
    if (hasList() && std::count(names.begin(), names.end(), "Snooze"))
        expectARequestToOpenItsTip(names, language);
    expectTheWayBack();
    if (hasList()) {
        EXPECT_EQ(rows(), rowsOf(names, language));
        expectTheLastTipToOpen(names, language);
        return;
    }
    request({{"appID", "com.ravella.kest"}, {"page", "99"}});
    test_ui::runFor(1);
    EXPECT_EQ(top(), "nothing");
    expectARequestToOpenItsTip(names, language);
}

void ChangeTest::expectARequestToOpenItsTip(const Names& names, Language language) {
    request({{"appID", "com.example.alarm"}, {"page", "2"}});
    test_ui::runFor(1);
    EXPECT_EQ(top(), pageOf("Snooze", names, language));
    EXPECT_THAT(newRecords(), ElementsAre("KT03 " + tips::title("Snooze", language)));
}

void ChangeTest::expectTheWayBack() {
    for (unsigned int left = levels(); left > 1; --left) {
        ASSERT_EQ(levels(), left);
        ASSERT_EQ(topView(), "KestContentView");
        back();
        test_ui::runFor(0.7);
    }
    EXPECT_FALSE(test_ui::hasEnded());
    EXPECT_EQ(topView(), hasList() ? "KestMainView" : "");
    EXPECT_THAT(newRecords(), IsEmpty());
}

void ChangeTest::expectTheLastTipToOpen(const Names& names, Language language) {
    // It is behind every place at which tips come and go.
    tapRow(names.size() - 1);
    test_ui::runFor(0.35);
    EXPECT_EQ(top(), pageOf(names.back(), names, language));
    EXPECT_THAT(newRecords(), ElementsAre("KT01 " + tips::title(names.back(), language)));
    back();
    test_ui::runFor(0.7);
    EXPECT_EQ(topView(), "KestMainView");
    EXPECT_THAT(newRecords(), IsEmpty());
}
