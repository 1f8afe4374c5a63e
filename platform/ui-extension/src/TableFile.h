#pragma once

#include <map>
#include <stdexcept>
#include <string>
#include <vector>

namespace uxt {

/// Why a table was refused: "file:line: error: what", or "file: error: what" where no line is to blame.
class TableError : public std::runtime_error {
public:
    TableError(const std::string& file, const std::string& what);
    TableError(const std::string& file, long line, const std::string& what);
};

/// What a table file of either kind looks like: a root element that holds nothing but empty elements of one name,
/// each with all of the same attributes, the first of which is its key.
struct TableShape {
    std::string root;
    std::string entry;
    std::vector<std::string> attributes;
};

struct TableEntry {
    long line = 0;
    std::map<std::string, std::string> values;
};

/// Reads a table file from the disk and holds it against its shape. It fetches nothing, expands no entities, opens
/// regular files only and stops at 1 MiB. Throws TableError for the first thing that is wrong.
std::vector<TableEntry> readTableFile(const std::string& file, const TableShape& shape);

}  // namespace uxt
