#pragma once

#include <SQLiteCpp/Exception.h>

#include <filesystem>
#include <string>

namespace device {

/// Whether the failure says that the file's contents are not what SQLite wrote.
bool tellsOfDamage(const SQLite::Exception& failure);

/// One line for people about a failure of the database in `file`: the file, what is wrong, what to do.
std::string lineFor(const std::filesystem::path& file, const SQLite::Exception& failure);

}  // namespace device
