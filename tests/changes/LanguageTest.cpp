#include "States.h"

/// The display language changes: everything that can be read is read in it from then on. A pager over the list closes;
/// what lies beneath it stays.
class LanguageChange : public ChangeTest {};

INSTANTIATE_TEST_SUITE_P(Changes, LanguageChange,
                         testing::ValuesIn(ChangeTest::cellsWhereThePagerCloses("list 팁: 팁 및 안내", "list 팁: 음악",
                                                                                "page 10개 중 2: 알람, 알람 사용법")),
                         ChangeTest::nameOfCell);

TEST_P(LanguageChange, IsReadEverywhere) {
    reachState();
    setLanguage(Language::Korean);
    expectWhatTheCellSays(tips::atFirst(), Language::Korean);
}
