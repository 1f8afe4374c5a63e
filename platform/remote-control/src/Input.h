#pragma once

#include "Playback.h"

#include <Evas.h>

#include <string>
#include <vector>

namespace remote_control {

/// What a finger or a key does to a canvas, as steps in time. The events are those that a real pointer or keyboard
/// would cause, with the clock of the main loop. The canvas must live as long as the steps are carried out.
namespace input {

/// Throws device::Error when the place is outside the canvas.
std::vector<Playback::Step> tap(Evas* canvas, int x, int y);
/// Moves with a finger down, evenly, in `seconds`.
/// Throws device::Error when an end is outside the canvas or the time is not from 0.01 to 10 seconds.
std::vector<Playback::Step> swipe(Evas* canvas, int fromX, int fromY, int toX, int toY, double seconds);
/// Throws device::Error for an unknown key; the message names the known ones.
std::vector<Playback::Step> key(Evas* canvas, const std::string& name);

}  // namespace input

}  // namespace remote_control
