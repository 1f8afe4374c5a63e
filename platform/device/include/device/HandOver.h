#pragma once

#include <string>
#include <utility>
#include <vector>

namespace device {

class Folder;

/// Gives the extras of a launch request to the process that is the application already, over the device's bus. Waits
/// for one that has only just begun, ten seconds at the longest, and five for its answer.
/// False when it has ended meanwhile. Throws Error when there is no bus, when it does not answer, and for an extra
/// that is not UTF-8.
bool handOver(const Folder& folder, const std::string& appId,
              const std::vector<std::pair<std::string, std::string>>& extras);

}  // namespace device
