#pragma once

#include <SQLiteCpp/Database.h>

namespace device {

/// The schema's version that this build writes and reads. It takes over a database of an older one.
inline constexpr int schemaVersion = 3;

/// Whether nothing has been stored yet, not even a table.
bool isFresh(SQLite::Database& sql);

/// Whether the database has every table of that version; false for a version that never was.
bool hasTablesOf(SQLite::Database& sql, int version);

/// Brings the database, fresh or of an older version, to schemaVersion in one step, so that a failure (a full disk)
/// leaves it as it was. A fresh one gets the settings of a fresh device. Throws SQLite::Exception.
void upgradeSchema(SQLite::Database& sql);

}  // namespace device
