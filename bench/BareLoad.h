#pragma once

#include <SQLiteCpp/SQLiteCpp.h>

#include <filesystem>
#include <map>
#include <string>
#include <vector>

namespace bench {

/// Reads and frees each file with libxml2 and does nothing with it. Throws std::runtime_error when one is broken.
void parseBare(const std::vector<std::filesystem::path>& files);

/// A database that takes the preferences of a full load in the way that a device's does: the same journal, one
/// statement and one transaction a value.
class BareStore {
public:
    explicit BareStore(const std::filesystem::path& file);

    void write(const std::map<std::string, std::string>& values);

private:
    SQLite::Database sql_;
    SQLite::Statement insert_;
};

}  // namespace bench
