#pragma once

#include "device/LaunchRequest.h"

#include <string>

namespace device {

class Bus;
class Folder;

/// Gives the extras of a launch request to the process that is the application already, over the device's bus. Waits
/// for one that has only just begun, ten seconds at the longest, and five for its answer.
/// False when it has ended meanwhile, without having taken the request. Throws Error when there is no bus, when it does
/// not answer or refuses the request, and for an extra that is not UTF-8.
bool handOver(const Folder& folder, const std::string& appId, const Extras& extras);

/// Waits, as long, until the process that is the application already is on the bus that has started this one, which
/// then hands it what it was asked for.
/// False when it has ended meanwhile. Throws Error when there is no bus, when it is another one that the device keeps
/// to, and when the process does not come up on it.
bool waitOnStartingBus(const Folder& folder, const std::string& appId);

/// Throws Error when this process was started by another bus than this one: what that one was asked for cannot arrive.
void requireStartingBus(const Bus& bus);

}  // namespace device
