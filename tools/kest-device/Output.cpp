#include "Output.h"

#include <algorithm>
#include <cstdio>
#include <iostream>

namespace tool {

namespace {

/// How many columns of a terminal a text takes, as far as characters are one column wide each.
std::size_t charactersIn(const std::string& utf8) {
    return static_cast<std::size_t>(
        std::count_if(utf8.begin(), utf8.end(), [](char character) { return (character & 0xC0) != 0x80; }));
}

}  // namespace

void print(const Json& json) {
    std::cout << json.dump(2, ' ', false, Json::error_handler_t::replace) << '\n';
}

void printOnOneLine(const Json& json) {
    std::cout << json.dump(-1, ' ', false, Json::error_handler_t::replace) << '\n';
}

void printTable(const std::vector<std::vector<std::string>>& rows) {
    std::vector<std::size_t> widths;
    for (const auto& row : rows) {
        widths.resize(std::max(widths.size(), row.size()));
        for (std::size_t i = 0; i < row.size(); ++i) {
            widths[i] = std::max(widths[i], charactersIn(row[i]));
        }
    }
    for (const auto& row : rows) {
        for (std::size_t i = 0; i < row.size(); ++i) {
            std::cout << row[i];
            if (i + 1 < row.size()) {
                std::cout << std::string(widths[i] - charactersIn(row[i]) + 2, ' ');
            }
        }
        std::cout << '\n';
    }
}

std::string oneLine(const std::string& text) {
    std::string line;
    for (const char character : text) {
        const auto byte = static_cast<unsigned char>(character);
        if (character == '\n') {
            line += "\\n";
        } else if (byte < ' ' || byte == 0x7f) {
            char code[5];
            std::snprintf(code, sizeof code, "\\x%02x", byte);
            line += code;
        } else {
            line += character;
        }
    }
    return line;
}

}  // namespace tool
