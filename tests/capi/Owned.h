#pragma once

#include <cstdlib>
#include <memory>
#include <optional>
#include <string>

/// What a service gave out as `char*`, freed as its caller would; nullopt for NULL.
inline std::optional<std::string> owned(char* text) {
    const std::unique_ptr<char, decltype(&std::free)> freed(text, &std::free);
    return text ? std::optional<std::string>(text) : std::nullopt;
}
