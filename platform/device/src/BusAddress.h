#pragma once

#include <optional>
#include <string>
#include <vector>

namespace device {

class Folder;

/// The addresses at which the device's bus may be: what the environment names, then what the folder names.
std::vector<std::string> busAddresses(const Folder& folder);

/// Whether a bus answers at the address. Only local sockets are tried; a bus that accepts and stays silent
/// (a stopped process) does not count. Takes 2 s at the longest.
bool answers(const std::string& address);

}  // namespace device
