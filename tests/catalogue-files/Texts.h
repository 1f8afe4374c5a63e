#pragma once

#include <optional>
#include <string>
#include <vector>

namespace catalogue {

/// A text of the application's own domain or of the device's, compiled as they ship; nullopt when neither has it.
std::optional<std::string> sharedText(const std::string& language, const std::string& id);

/// The languages that a folder of translations has, in alphabetical order ("en_US", ...).
std::vector<std::string> languagesIn(const std::string& folder);

}  // namespace catalogue
