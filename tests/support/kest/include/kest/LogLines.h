#pragma once

#include "support/TemporaryDevice.h"

#include <gmock/gmock.h>

#include <ostream>
#include <regex>
#include <string>
#include <vector>

/// The application's lines in the device's log, and the lines that its conventions make of a level and a message.
namespace kest_log {

struct Line {
    char level = ' ';      ///< I, W, E
    std::string file;      ///< "KestContentMgr.cpp"
    std::string function;  ///< "loadContentsList"
    std::string message;   ///< with the escapes that colour it

    bool operator==(const Line&) const = default;
};

inline std::ostream& operator<<(std::ostream& stream, const Line& line) {
    std::string message = line.message;
    for (auto at = message.find('\x1b'); at != std::string::npos; at = message.find('\x1b', at))
        message.replace(at, 1, "\\e");
    return stream << line.level << ' ' << line.file << ": " << line.function << " > " << message;
}

inline Line trace(const std::string& file, const std::string& function, const std::string& colouredMessage) {
    return {'I', file, function, colouredMessage};
}
inline Line begin(const std::string& file, const std::string& function) {
    return trace(file, function, "\x1b[0;32mBEGIN >>>>\x1b[0;m");
}
inline Line hit(const std::string& file, const std::string& function) {
    return trace(file, function, "\x1b[0;34m>>>HIT<<<\x1b[0;m");
}
inline Line info(const std::string& file, const std::string& function, const std::string& message) {
    return {'I', file, function, message};
}
inline Line warning(const std::string& file, const std::string& function, const std::string& message) {
    return {'W', file, function, "\x1b[0;35m" + message + "\x1b[0;m"};
}
inline Line error(const std::string& file, const std::string& function, const std::string& message) {
    return {'E', file, function, "\x1b[0;31m* Critical * " + message + "\x1b[0;m"};
}

/// Parses "I KEST file: function(line) > message". A line of the application's that has no such form fails the test.
inline std::vector<Line> parsed(const std::vector<std::string>& messages) {
    static const std::regex form("([A-Z]) KEST ([^:]*): ([^(]*(?:\\(\\))?)\\(\\d+\\) > ([^]*)");
    std::vector<Line> lines;
    for (const std::string& text : messages) {
        if (text.compare(1, 6, " KEST ") != 0)
            continue;
        // The form stands at the beginning; matching a long message whole would take the stack.
        const auto arrow = text.find(") > ");
        std::smatch parts;
        const std::string head = arrow == std::string::npos ? text : text.substr(0, arrow + 4);
        if (std::regex_match(head, parts, form))
            lines.push_back({parts[1].str()[0], parts[2], parts[3], text.substr(arrow + 4)});
        else
            ADD_FAILURE() << "a line of no known form: " << text;
    }
    return lines;
}

/// All of the application's lines so far.
inline std::vector<Line> all(const support::TemporaryDevice& device) {
    return parsed(device.logMessages());
}

/// Only the lines of that level ('I', 'W', 'E').
inline std::vector<Line> ofLevel(char level, const std::vector<Line>& lines) {
    std::vector<Line> found;
    for (const Line& line : lines)
        if (line.level == level)
            found.push_back(line);
    return found;
}

}  // namespace kest_log
