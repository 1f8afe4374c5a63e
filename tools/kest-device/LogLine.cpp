#include "LogLine.h"

#include "Session.h"

#include <algorithm>
#include <array>
#include <cctype>
#include <charconv>

namespace tool {

namespace {

constexpr std::size_t timeLength = 23;

}  // namespace

std::optional<LogLine> LogLine::parse(const std::string& line) {
    const std::size_t tagBegin = timeLength + 3;
    if (line.size() < tagBegin || line[timeLength] != ' ' || line[timeLength + 2] != ' ' ||
        logLevels.find(line[timeLength + 1]) == std::string_view::npos) {
        return std::nullopt;
    }
    const std::size_t end = line.find(") ", tagBegin);
    const std::size_t bracket = end == std::string::npos ? end : line.rfind('(', end);
    if (bracket == std::string::npos || bracket < tagBegin) {
        return std::nullopt;
    }
    LogLine parsed{line.substr(0, timeLength), line[timeLength + 1], line.substr(tagBegin, bracket - tagBegin), 0,
                   line.substr(end + 2)};
    const auto [stop, error] = std::from_chars(line.data() + bracket + 1, line.data() + end, parsed.process);
    return error == std::errc() && stop == line.data() + end ? std::optional(parsed) : std::nullopt;
}

char logLevelNamed(const std::string& name) {
    static constexpr std::array words{"debug", "info", "warning", "error", "fatal"};
    std::string lower = name;
    std::transform(lower.begin(), lower.end(), lower.begin(), [](unsigned char c) { return std::tolower(c); });
    for (std::size_t i = 0; i < words.size(); ++i) {
        if (lower == words[i] || (lower.size() == 1 && lower[0] == words[i][0])) {
            return logLevels[i];
        }
    }
    throw UsageError("there is no level \"" + name + "\"; there are debug, info, warning, error and fatal");
}

std::string withoutColours(const std::string& text) {
    std::string plain;
    for (std::size_t at = 0; at < text.size(); ++at) {
        if (text.compare(at, 2, "\x1b[") == 0) {
            const std::size_t end = text.find_first_not_of("0123456789;", at + 2);
            if (end != std::string::npos && text[end] == 'm') {
                at = end;
                continue;
            }
        }
        plain += text[at];
    }
    return plain;
}

}  // namespace tool
