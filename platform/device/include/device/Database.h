#pragma once

#include <SQLiteCpp/SQLiteCpp.h>

#include <memory>

namespace device {

class Folder;

/// The device's SQLite database (WAL, one connection a process): its opening, its schema, its health.
/// What the tables mean is the business of the classes that use them.
class Database {
public:
    enum class Check {
        Quick,  ///< that the file is a database of ours: what an application's start can afford
        Full,   ///< and that every page of it is sound
    };

    /// Opens the folder's database, or makes it with the values of a fresh device.
    /// Throws Error (cannot be opened or written, disk full, made by a newer version), DamagedError (set aside).
    Database(const Folder& folder, Check check);

    SQLite::Database& sql() { return *sql_; }

private:
    std::unique_ptr<SQLite::Database> sql_;
};

}  // namespace device
