#pragma once

#include <functional>

/// The test's own clock in place of the machine's: timers, animators and transitions run at once, in their order,
/// and the same way at every run.
namespace test_ui::clock {

/// Replaces the clock. To be called before EFL starts.
void start();
/// Has EFL's main loop wait on this clock. To be called when EFL has started.
void driveMainLoop();
/// Has animations tick on this clock, 60 times a second. Every new window needs it again; runFor() does it.
void driveAnimations();
/// Forgets what belongs to a main loop that is about to end.
void stop();

/// Whether something asks for frames: an animation runs.
bool isAnimating();

/// Milliseconds, as input events carry them.
unsigned int timestamp();

}  // namespace test_ui::clock

namespace test_ui {

/// Lets the main loop run for `seconds` of the test's clock. False when somebody ended the main loop before.
bool runFor(double seconds);
/// Calls `function` from inside the main loop, as what a user does comes from there.
void inMainLoop(const std::function<void()>& function);
/// Whether somebody ended the main loop since EFL started: the application is over.
bool hasEnded();
/// Lets the main loop run until `condition` holds; false when it still does not after `seconds`.
bool runUntil(const std::function<bool()>& condition, double seconds = 5.0);

}  // namespace test_ui
