#pragma once

#include <string>
#include <vector>

namespace theme_test {

/// One line of a group's table in docs/theme.md.
struct Promise {
    std::string group;
    std::string kind;  ///< "part", "in", "in \"\"", "out" or "data"
    std::string name;
    std::string value;  ///< of a data item
};

/// The groups that docs/theme.md names, in its order.
std::vector<std::string> promisedGroups();
/// All lines of their tables.
std::vector<Promise> promises();
/// The first column of the table that begins with the header `| <title> |`.
std::vector<std::string> promisedNames(const std::string& title);

}  // namespace theme_test
