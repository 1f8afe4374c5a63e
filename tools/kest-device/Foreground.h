#pragma once

#include "Applications.h"

#include <vector>

namespace tool {

/// The application in front, of several that run (one at least): the one that was launched last, be it that it was
/// started then or that it ran and was handed over to. Throws device::Error when the device cannot be opened.
const RunningApplication& inFront(Session& session, const std::vector<RunningApplication>& running);

/// Whether the process began so lately that an application in it may be on its way to the screen.
bool isComingUp(const device::Process& process);

}  // namespace tool
