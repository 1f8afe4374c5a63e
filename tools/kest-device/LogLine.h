#pragma once

#include <optional>
#include <string>
#include <string_view>

namespace tool {

/// A line of the device's log: "2026-01-31 12:00:00.123 I KEST(4711) message".
struct LogLine {
    std::string time;
    char level = 'I';
    std::string tag;
    int process = 0;
    std::string message;

    /// nullopt for a line that is not written like that.
    static std::optional<LogLine> parse(const std::string& line);
};

/// The levels' letters, the least important first.
inline constexpr std::string_view logLevels = "DIWEF";

/// The level that a person names: by its letter or its word, in capitals or not ("W", "warning").
/// Throws UsageError that lists the levels.
char logLevelNamed(const std::string& name);

/// The text without the escape sequences that give it colours on a terminal.
std::string withoutColours(const std::string& text);

}  // namespace tool
