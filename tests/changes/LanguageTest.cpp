#include "States.h"

using testing::IsEmpty;

/// The display language changes: everything that can be read is read in it from then on. A pager over the list closes;
/// what lies beneath it stays.
class LanguageChange : public ChangeTest {};

INSTANTIATE_TEST_SUITE_P(
    Changes, LanguageChange,
    testing::Values(Cell{State::List, "list 팁: 팁 및 안내"}, Cell{State::ScrolledList, "list 팁: 걸음"},
                    Cell{State::PagerComes, "list 팁: 팁 및 안내"}, Cell{State::PagerAtRest, "list 팁: 팁 및 안내"},
                    Cell{State::PicturesPlay, "list 팁: 팁 및 안내"}, Cell{State::FingerSwipes, "list 팁: 팁 및 안내"},
                    Cell{State::PagesGlide, "list 팁: 팁 및 안내"},
                    Cell{State::RequestedPagerComes, "list 팁: 팁 및 안내"},
                    Cell{State::RequestedPager, "list 팁: 팁 및 안내"},
                    Cell{State::RequestedPagers, "page 12개 중 2: 알람, 알람 사용법"},
                    Cell{State::TurnedPager, "list 팁: 팁 및 안내"}, Cell{State::Nothing, "nothing"}),
    ChangeTest::nameOfCell);

TEST_P(LanguageChange, IsReadEverywhere) {
    reachState();
    setLanguage(Language::Korean);
    comeToRest();
    EXPECT_EQ(top(), GetParam().top);
    expectToWork(tips::atFirst(), Language::Korean);
    EXPECT_THAT(newErrors(), IsEmpty());
}
