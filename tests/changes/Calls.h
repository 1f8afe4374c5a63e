#pragma once

#include <string>
#include <vector>

/// What the application and its platform say and hear, as far as no state of theirs shows it.
namespace calls {

struct Line {
    char level = ' ';     ///< I, W, E
    std::string message;  ///< "KestMainView.cpp: __selectItemCb > selected index:3", without colours
};

/// Lines that were written to the device's log since the last call.
std::vector<Line> newLines();

/// How often pages heard since the last call that the button of a sequence of pictures was pressed.
int newPresses();

}  // namespace calls
