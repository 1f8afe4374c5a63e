#pragma once

#include "Applications.h"

#include <vector>

namespace tool {

/// The application in front, of several that run (one at least): the one that had a launch request last, by its own
/// word, and for as long as that cannot be asked for, the one that was started last.
const RunningApplication& inFront(Session& session, const std::vector<RunningApplication>& running);

/// Whether the process began so lately that an application in it may be on its way to the screen.
bool isComingUp(const device::Process& process);

}  // namespace tool
