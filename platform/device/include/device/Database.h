#pragma once

#include <SQLiteCpp/SQLiteCpp.h>

#include <chrono>
#include <filesystem>
#include <map>
#include <memory>
#include <string>
#include <utility>

namespace device {

class FileLock;
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
    /// Throws Error (cannot be opened or written, disk full, made by a newer version), DamagedError (set aside),
    /// DamagedInUseError (not set aside: an application runs on it, which would go on with what nobody else reads).
    /// Not for a process that has an application's lock itself.
    Database(const Folder& folder, Check check);

    /// Whether it was set aside, or otherwise replaced, since it was opened: nobody reads what is written here. It
    /// stays in its place once this has said no to a process that has an application's lock.
    /// Throws Error when another process keeps the database's lock.
    bool isReplaced() const;

    SQLite::Database& sql() { return *sql_; }
    const std::filesystem::path& file() const { return file_; }

    /// One use of a prepared statement that the database keeps; the statement is free for the next use when this ends.
    class Query {
    public:
        explicit Query(SQLite::Statement& statement) : statement_(statement) {}
        ~Query();
        Query(const Query&) = delete;
        Query& operator=(const Query&) = delete;
        SQLite::Statement* operator->() const { return &statement_; }

    private:
        SQLite::Statement& statement_;
    };

    /// The statement of that text, with its parameters bound in their order. Not to be used twice at the same time.
    template <class... Parameters>
    Query query(const char* text, const Parameters&... parameters) {
        SQLite::Statement& prepared = statement(text);
        [[maybe_unused]] int index = 0;
        (prepared.bind(++index, parameters), ...);
        return Query(prepared);
    }

    /// While it lives, what another process keeps locked fails at once, or after `patience`, instead of after five
    /// seconds.
    class Impatience {
    public:
        explicit Impatience(Database& database, std::chrono::milliseconds patience = {});
        ~Impatience();
        Impatience(const Impatience&) = delete;
        Impatience& operator=(const Impatience&) = delete;

    private:
        Database& database_;
    };

    /// While it lives, no process opens the database, so that its files can be removed.
    class Hold {
    public:
        /// Throws Error when another process keeps the database's lock.
        explicit Hold(const Folder& folder);
        ~Hold();
        Hold(const Hold&) = delete;
        Hold& operator=(const Hold&) = delete;

    private:
        std::unique_ptr<FileLock> lock_;
    };

    /// Runs `work` and turns a failure of the database in it into an Error for people.
    template <class Work>
    auto guarded(Work&& work) -> decltype(work()) {
        try {
            return work();
        } catch (const SQLite::Exception& failure) {
            fail(failure);
        }
    }

private:
    SQLite::Statement& statement(const char* text);
    [[noreturn]] void fail(const SQLite::Exception& failure);

    std::filesystem::path file_;
    std::filesystem::path lock_;
    std::filesystem::path suspicion_;
    std::unique_ptr<SQLite::Database> sql_;
    std::map<std::string, SQLite::Statement, std::less<>> statements_;
};

}  // namespace device
