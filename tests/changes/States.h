#pragma once

#include "ChangesTest.h"

#include <ostream>

/// What is on the screen when something changes.
enum class State {
    List,
    ScrolledList,
    PagerComes,
    PagerAtRest,
    PicturesPlay,
    FingerSwipes,
    PagesGlide,
    RequestedPagerComes,
    RequestedPager,
    RequestedPagers,
    TurnedPager,
    Nothing,
};

/// "WhileAPagerComes": as it ends the name of a test.
std::string nameOf(State state);

/// A change in a state, and what is to be seen on the top when it has come to rest. The tables of these are the
/// matrix: a row for every state, a table for every change.
struct Cell {
    State state;
    std::string top;

    friend void PrintTo(const Cell& cell, std::ostream* stream) { *stream << nameOf(cell.state) << ": " << cell.top; }
};

/// A change in every state. Where tips are opened before it: the second row ("Alarm", whose pictures play) where a
/// pager comes or plays, else the third ("Snooze"), from which a swipe or a request goes to the fourth ("Music").
class ChangeTest : public ChangesTest, public testing::WithParamInterface<Cell> {
public:
    static std::string nameOfCell(const testing::TestParamInfo<Cell>& cell) { return nameOf(cell.param.state); }

    // Tables that several changes have in common, in English.
    /// Every view stays where it was; what a finger moved comes to rest.
    static std::vector<Cell> cellsWhereNothingMoves();
    /// One pager goes, and the list is built anew, from its top.
    static std::vector<Cell> cellsWhereThePagerCloses();
    /// One pager goes, and the list says these; the page beneath, where there is one, says that.
    static std::vector<Cell> cellsWhereThePagerCloses(const std::string& list, const std::string& scrolledList,
                                                      const std::string& pageBeneath);
    /// A pager stays open over the list, with these pages in view; requested ones do not hear how many there are now.
    static std::vector<Cell> cellsWhereThePagerCounts(const std::string& scrolledList, const std::string& count,
                                                      const std::string& fourthTitle);

protected:
    /// Brings the application into the state of the cell, and forgets what led there.
    void reachState();
    /// Lets a change be followed by everything that it sets off, and lifts the finger where one is down.
    void comeToRest();
    /// Whether there is a list, on the top or beneath.
    bool hasList() const { return GetParam().state != State::Nothing; }

    /// Right after a change: what the table says shows, everything works, and nothing was an error.
    void expectWhatTheCellSays(const Names& names, Language language);
    /// Opens a tip by request where there is one to open. Goes back to the list, or, where there is none, opens a tip
    /// by request. Then the list has these rows, a tap on the last one opens its tip, the way back leads to the list,
    /// and usage was recorded once a tip.
    void expectToWork(const Names& names, Language language);
    /// From a pager on the top. None of its views is gone too early.
    void expectTheWayBack();
    void expectARequestToOpenItsTip(const Names& names, Language language);
    void expectTheLastTipToOpen(const Names& names, Language language);

private:
    void openRow(std::size_t menu, double seconds);

    bool fingerIsDown_ = false;
};
