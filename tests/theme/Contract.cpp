#include "Contract.h"

#include "support/TemporaryFolder.h"

#include <regex>
#include <sstream>

namespace theme_test {
namespace {

std::vector<std::string> documentLines() {
    std::istringstream stream(support::readFile(PROJECT "/docs/theme.md"));
    std::vector<std::string> lines;
    for (std::string line; std::getline(stream, line);)
        lines.push_back(line);
    return lines;
}

const std::regex heading(R"(### `([^`]+)`)");
const std::regex row(R"re(\| (part|in|in ""|out|data) \| `([^`]+)` \| (.*) \|)re");
const std::regex quotedName(R"(\| `([^`]+)` \|.*)");

std::string withoutQuotes(const std::string& text) {
    const bool isQuoted = text.size() > 1 && text.front() == '`' && text.back() == '`';
    return isQuoted ? text.substr(1, text.size() - 2) : text;
}

}  // namespace

std::vector<std::string> promisedGroups() {
    std::vector<std::string> groups;
    std::smatch match;
    for (const std::string& line : documentLines()) {
        if (std::regex_match(line, match, heading))
            groups.push_back(match[1]);
    }
    return groups;
}

std::vector<Promise> promises() {
    std::vector<Promise> all;
    std::string group;
    std::smatch match;
    for (const std::string& line : documentLines()) {
        if (std::regex_match(line, match, heading))
            group = match[1];
        else if (std::regex_match(line, match, row))
            all.push_back({group, match[1], match[2], withoutQuotes(match[3])});
    }
    return all;
}

std::vector<std::string> promisedNames(const std::string& title) {
    std::vector<std::string> names;
    bool isInside = false;
    std::smatch match;
    for (const std::string& line : documentLines()) {
        if (line.rfind("| " + title + " |", 0) == 0)
            isInside = true;
        else if (line.rfind('|', 0) != 0)
            isInside = false;
        else if (isInside && std::regex_match(line, match, quotedName))
            names.push_back(match[1]);
    }
    return names;
}

}  // namespace theme_test
