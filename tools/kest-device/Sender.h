#pragma once

#include "Launcher.h"
#include "device/Launches.h"

#include <optional>

namespace tool {

/// What has come of a launch request.
struct Launched {
    device::LaunchOutcome outcome = device::LaunchOutcome::Started;
    std::optional<device::Process> process;  ///< none: it has ended by itself
    bool headless = false;
};

/// Gives the request to the application that runs, or starts it with it, headless also where the application in front
/// is; returns when the screen has settled. The device remembers the launch as this tool's.
/// Throws device::Error when the application cannot be started or does not take the request.
Launched send(Session& session, const LaunchRequest& request);

}  // namespace tool
