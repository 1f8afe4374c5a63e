#include "States.h"

using testing::IsEmpty;

/// An application comes, and with it a tip of its own: the list has it. A pager over the list closes; what lies beneath
/// it keeps the pages that it was opened with.
class Installation : public ChangeTest {};

INSTANTIATE_TEST_SUITE_P(Changes, Installation, testing::ValuesIn(ChangeTest::cellsWhereThePagerCloses()),
                         ChangeTest::nameOfCell);

TEST_P(Installation, BringsItsTip) {
    reachState();
    install("com.example.weather");
    // Only the list looks at what is installed.
    expectWhatTheCellSays(hasList() ? tips::with(tips::atFirst(), "Weather") : tips::atFirst(), Language::English);
}

/// An application goes, and its tip with it.
class Removal : public ChangeTest {};

INSTANTIATE_TEST_SUITE_P(Changes, Removal, testing::ValuesIn(ChangeTest::cellsWhereThePagerCloses()),
                         ChangeTest::nameOfCell);

TEST_P(Removal, TakesItsTipAway) {
    reachState();
    uninstall("com.example.music");
    expectWhatTheCellSays(hasList() ? tips::without(tips::atFirst(), "Music") : tips::atFirst(), Language::English);
}

/// An application is replaced by a later version, even one without the tip that it had.
class Update : public ChangeTest {};

INSTANTIATE_TEST_SUITE_P(Changes, Update, testing::ValuesIn(ChangeTest::cellsWhereNothingMoves()),
                         ChangeTest::nameOfCell);

TEST_P(Update, ChangesNothing) {
    reachState();
    update("com.example.music");
    expectWhatTheCellSays(tips::atFirst(), Language::English);
}

class FailedInstallation : public ChangeTest {};

INSTANTIATE_TEST_SUITE_P(Changes, FailedInstallation, testing::ValuesIn(ChangeTest::cellsWhereNothingMoves()),
                         ChangeTest::nameOfCell);

TEST_P(FailedInstallation, ChangesNothing) {
    reachState();
    failToInstall("com.example.weather");
    expectWhatTheCellSays(tips::atFirst(), Language::English);
}

/// The device comes to another country. The catalogue hears of it when it is loaded next.
class CountryChange : public ChangeTest {};

INSTANTIATE_TEST_SUITE_P(Changes, CountryChange, testing::ValuesIn(ChangeTest::cellsWhereNothingMoves()),
                         ChangeTest::nameOfCell);

TEST_P(CountryChange, ShowsWhenTheCatalogueIsLoadedNext) {
    reachState();
    setCountry("IN");
    comeToRest();
    EXPECT_EQ(top(), GetParam().top);
    expectToWork(tips::atFirst(), Language::English);
    if (hasList()) {
        install("com.example.weather");
        test_ui::runFor(1);
        expectToWork(tips::with(tips::with(tips::atFirst(), "Weather"), "Cricket"), Language::English);
    }
    EXPECT_THAT(newErrors(), IsEmpty());
}
