#pragma once

#include <nlohmann/json.hpp>

#include <string>
#include <vector>

namespace tool {

using Json = nlohmann::ordered_json;

/// Prints the value on standard output, indented, as UTF-8 in any case.
void print(const Json& json);
/// Prints it on one line.
void printOnOneLine(const Json& json);

/// Prints rows of words in columns that are as wide as their longest word; the last column is as it is.
void printTable(const std::vector<std::vector<std::string>>& rows);

/// The text on one line: line breaks and other control characters become "\n", "\x1b" and so on.
std::string oneLine(const std::string& text);

}  // namespace tool
