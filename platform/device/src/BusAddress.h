#pragma once

#include <optional>
#include <string>
#include <vector>

namespace device {

class Folder;

/// A place where the device's bus may be.
struct BusAddress {
    std::string text;
    bool isPrivate;  ///< named by the device's folder, not by the environment
};

/// In the order in which they are to be tried: the device's private bus comes first, so that a session bus that turns
/// up later, in another terminal, does not part the tool from what runs.
std::vector<BusAddress> busAddresses(const Folder& folder);

/// Whether the bus that the address means answers there and takes this user. Only local sockets are tried; one that
/// accepts and stays silent (of a stopped process) does not count. Takes 2 s at the longest.
bool answers(const std::string& address);

}  // namespace device
