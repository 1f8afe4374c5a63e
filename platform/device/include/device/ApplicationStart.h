#pragma once

#include "device/Process.h"

#include <string>
#include <utility>
#include <vector>

namespace device {

class Folder;
struct Package;

/// Throws Error when the package's manifest names no program, or when that cannot run.
void requireProgram(const Package& package);

/// How an application of a device is started.
struct ApplicationStart {
    std::vector<std::pair<std::string, std::string>> extras;       ///< of its launch request
    std::vector<std::pair<std::string, std::string>> environment;  ///< set beside what this process has
    /// Whether it is running already, so that this process is a second one: what the first has said is kept.
    bool again = false;
};

/// Starts the program of a package as a device's launcher does: with its extras as KEY=VALUE words, on this device,
/// and with its standard output and error in Folder::output(), or nowhere where that cannot be written.
/// Throws Error when it cannot be started.
Process startApplication(const Folder& folder, const Package& package, const ApplicationStart& start);

/// What the application said last, on one line, for people to see why it ended; "" for nothing.
std::string lastWordsOf(const Folder& folder, const std::string& appId);

}  // namespace device
