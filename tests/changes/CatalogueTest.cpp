#include "States.h"

#include <filesystem>

using testing::ElementsAre;
using testing::IsEmpty;

/// The catalogue's files change. Nobody tells of that: it shows when the catalogue is loaded next.
class CatalogueChange : public ChangeTest {
protected:
    /// A row without a tip, as its list has more rows than the catalogue has tips.
    static const std::string emptyRow;

    /// Rows are only refreshed: their number stays.
    void expectRows(const Names& names, Language language, std::size_t count) {
        std::vector<std::string> expected = rowsOf(names, language);
        expected.resize(count, emptyRow);
        EXPECT_EQ(rows(), expected);
    }
    /// A change of the theme comes to what the table of the cell says, one of the language has every tip in it, and an
    /// installation has the list build its rows anew.
    void expectToShowStepByStep(const Names& catalogue);
    /// Has the list build its rows anew.
    void installWeather() {
        install("com.example.weather");
        test_ui::runFor(1);
    }
};

const std::string CatalogueChange::emptyRow = ", ";

void CatalogueChange::expectToShowStepByStep(const Names& catalogue) {
    reachState();
    writeMenuFile(catalogue);
    setTheme("dark");
    comeToRest();
    EXPECT_EQ(top(), GetParam().top);
    setLanguage(Language::Korean);
    comeToRest();
    expectTheWayBack();
    if (hasList()) {
        expectRows(catalogue, Language::Korean, tips::atFirst().size());
        installWeather();
    }
    expectToWork(hasList() ? tips::with(catalogue, "Weather") : catalogue, Language::Korean);
    EXPECT_THAT(newErrors(), IsEmpty());
}

/// The main menu file is gone when the display language changes, which loads the catalogue with force. What has no
/// record keeps its text; the header counts what there is.
class LostMenuFile : public CatalogueChange {
protected:
    void remove() { std::filesystem::remove(mainMenuFile()); }
    std::string failure() const {
        return "KestContentMgr.cpp: __loadMainMenu > Failed to access: -1, " + mainMenuFile().string();
    }
    /// The list is empty, but not dead, and it fills when the file is back.
    void expectTheListToRecover() {
        expectTheWayBack();
        expectRows({}, Language::Korean, tips::atFirst().size());
        tapRow(3);
        test_ui::runFor(0.5);
        EXPECT_EQ(topView(), "KestMainView");
        EXPECT_THAT(newRecords(), IsEmpty());
        EXPECT_THAT(newErrors(), ElementsAre("KestMainView.cpp: __selectItemCb > no record for index:5"));
        installWeather();
        EXPECT_THAT(rows(), IsEmpty());
        EXPECT_THAT(newErrors(), ElementsAre(failure()));
        writeMenuFile(tips::atFirst());
        uninstall("com.example.weather");
        test_ui::runFor(1);
    }
};

INSTANTIATE_TEST_SUITE_P(Changes, LostMenuFile,
                         testing::ValuesIn(ChangeTest::cellsWhereThePagerCloses(
                             "list 팁: 팁 및 안내", "list 팁: ", "page 0개 중 2: Alarm, How to use Alarm")),
                         ChangeTest::nameOfCell);

TEST_P(LostMenuFile, EmptiesTheListUntilItIsBack) {
    reachState();
    remove();
    setLanguage(Language::Korean);
    comeToRest();
    EXPECT_EQ(top(), GetParam().top);
    EXPECT_THAT(newErrors(), ElementsAre(failure()));
    if (hasList()) {
        expectTheListToRecover();
    } else {
        writeMenuFile(tips::atFirst());
        setLanguage(Language::Korean);
    }
    expectToWork(tips::atFirst(), Language::Korean);
    EXPECT_THAT(newErrors(), IsEmpty());
}

/// There is one tip more, which a change of the theme has the list find, from the cache; the cache has no texts of it.
/// A change of the language reads all files. Pages that were there before the list hear of the theme before it, and
/// count what there was.
class LargerCatalogue : public CatalogueChange {};

INSTANTIATE_TEST_SUITE_P(Changes, LargerCatalogue,
                         testing::ValuesIn(ChangeTest::cellsWhereThePagerCounts("list Tips: Music", "11", "Music")),
                         ChangeTest::nameOfCell);

TEST_P(LargerCatalogue, ShowsStepByStep) {
    expectToShowStepByStep(tips::with(tips::atFirst(), "Torch"));
}

/// There is one tip less. Where a page stays open, its title is that of the tip that stands at its place now, as the
/// title is written at every change of the theme, and its text is still the one that it was filled with.
class SmallerCatalogue : public CatalogueChange {};

INSTANTIATE_TEST_SUITE_P(Changes, SmallerCatalogue,
                         testing::ValuesIn(ChangeTest::cellsWhereThePagerCounts("list Tips: Mail", "9", "Mail")),
                         ChangeTest::nameOfCell);

TEST_P(SmallerCatalogue, ShowsStepByStep) {
    expectToShowStepByStep(tips::without(tips::atFirst(), "Music"));
}
