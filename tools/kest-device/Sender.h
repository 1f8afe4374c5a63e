#pragma once

#include "Launcher.h"
#include "device/Launches.h"

#include <optional>
#include <string>

namespace tool {

/// What has come of a launch request.
struct Launched {
    device::LaunchOutcome outcome = device::LaunchOutcome::Started;
    std::optional<device::Process> process;  ///< none: it has ended by itself
    bool headless = false;
};

/// Gives the request to the application that runs, or starts it with it, headless also where the application in front
/// is; returns when the screen has settled. The device remembers the launch, with who asked for it.
/// Throws device::Error when the application cannot be started or does not take the request.
Launched send(Session& session, const LaunchRequest& request, const std::string& caller);

}  // namespace tool
