#pragma once

#include <SQLiteCpp/Database.h>

#include <filesystem>
#include <string>

namespace device {

/// What is wrong with the database, "" when nothing was found. Leaves the files as they are, whatever it finds.
/// `thorough`: reads every page. Throws SQLite::Exception, and Error for what is no damage (a newer version).
std::string damageOf(SQLite::Database& sql, const std::filesystem::path& file, bool thorough);

/// Renames the closed database and what belongs to it to "<file>.damaged-<UTC time>", to be called by one process
/// at a time. Returns a line that names both and says what to do. Throws Error when it cannot be renamed.
std::string setAside(const std::filesystem::path& file, const std::string& damage);

}  // namespace device
