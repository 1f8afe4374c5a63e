#pragma once

#include "Session.h"
#include "device/Process.h"

#include <string>
#include <vector>

namespace tool {

struct LaunchRequest {
    std::string appId;
    std::vector<std::pair<std::string, std::string>> extras;
    bool headless = false;
};

/// The installed package of that id. Throws device::Error when it is not installed or has no program that can run.
device::Package runnablePackage(device::Device& device, const std::string& appId);

/// Starts the package's application as a launcher does and returns when it has drawn its first screen.
/// Throws device::Error, with the application ended, when it ends before that or takes longer than 30 seconds.
device::Process launch(Session& session, const device::Package& package, const LaunchRequest& request);

}  // namespace tool
