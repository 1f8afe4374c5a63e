#pragma once

#include "ui/Undrawn.h"

#include <cstddef>
#include <random>

namespace test_ui {

class Screen;

/// A window in long use. Nothing is drawn meanwhile, which would take most of the time; what is left behind is counted.
class LongUse {
public:
    explicit LongUse(Evas_Object* window);

    /// All Evas objects of the window, also those inside others.
    int objects() const;
    /// How often the main loop finds something to do in a second; timers and animators that were left behind add to it.
    int turnsInASecond();
    /// The bytes that the process has allocated.
    static std::size_t memory();

private:
    Evas* canvas_;
    Undrawn undrawn_;
};

/// How often to do something: the short run is part of every run of the tests, KEST_SOAK=full in the environment asks
/// for the long one, of some minutes.
int timesOf(int shortRun, int longRun);

/// A finger's way from side to side across a screen 720 wide, fast or slow.
void swipeAtRandom(Screen& screen, std::mt19937& random);

}  // namespace test_ui
