#pragma once

#include "Session.h"

#include <map>
#include <optional>
#include <string>

namespace tool {

// The device's settings under the names that people use ("language", "country", "theme", "screen"), or as vconf
// keys, which hold a '/'. All throw device::Error that lists what there is when a name or a value is unknown.

/// The value in the form that people write it; nullopt when it is not set.
std::optional<std::string> readSetting(device::Device& device, const std::string& name);
/// All settings, by the names that people use where there is one.
std::map<std::string, std::string> readSettings(device::Device& device);

/// Checks the value and stores it, as a name's also where its vconf key was given. A change of country starts every
/// application anew: it clears their preferences.
void storeSetting(device::Device& device, const std::string& name, const std::string& value);
/// Gives the setting what it has on a fresh device, or removes it where that has none.
void removeSetting(device::Device& device, const std::string& name);

}  // namespace tool
