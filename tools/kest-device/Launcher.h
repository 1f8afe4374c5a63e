#pragma once

#include "Session.h"
#include "device/Error.h"
#include "device/LaunchRequest.h"
#include "device/Process.h"

#include <optional>
#include <string>
#include <vector>

namespace tool {

struct LaunchRequest {
    std::string appId;
    device::Extras extras;
    bool headless = false;
};

/// The request that words of the command line make: an application's id, then KEY=VALUE extras. Throws UsageError.
LaunchRequest requestOf(const std::vector<std::string>& words);

/// The installed package of that id. Throws device::Error when it is not installed or has no program that can run.
device::Package runnablePackage(device::Device& device, const std::string& appId);

/// Throws device::Error where there is nothing to draw on.
void requireDisplay(bool headless);

/// That the application ended before it was on the screen, with its last words. `how` is as endOfChild() says it.
device::Error earlyEnd(const device::Folder& folder, const std::string& appId, const std::string& how);

/// Starts the package's application as a launcher does and returns when it has drawn its first screen; nullopt when it
/// has ended with status 0 before. A device without a bus gets a private one, as long as something runs.
/// Throws device::Error, with the application ended, when it ends otherwise or takes longer than 30 seconds.
std::optional<device::Process> startOnDevice(Session& session, const device::Package& package,
                                             const LaunchRequest& request);

}  // namespace tool
