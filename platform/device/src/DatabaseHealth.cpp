#include "DatabaseHealth.h"

#include "DatabaseFailure.h"
#include "Schema.h"
#include "device/Error.h"
#include "device/OneLine.h"

#include <algorithm>
#include <ctime>
#include <sqlite3.h>
#include <unistd.h>

namespace device {
namespace {

/// While it lives, closing the database leaves its write-ahead log alone: evidence of a damaged one is kept whole.
class KeepLogOnClose {
public:
    explicit KeepLogOnClose(SQLite::Database& sql) : sql_(sql.getHandle()) { set(1); }
    KeepLogOnClose(const KeepLogOnClose&) = delete;
    KeepLogOnClose& operator=(const KeepLogOnClose&) = delete;
    void end() { set(0); }

private:
    void set(int on) { sqlite3_db_config(sql_, SQLITE_DBCONFIG_NO_CKPT_ON_CLOSE, on, nullptr); }
    sqlite3* sql_;
};

/// Nothing but our own SQL runs here, so an SQL error too is the fault of the file.
bool isTheFilesFault(const SQLite::Exception& failure) {
    return tellsOfDamage(failure) || (failure.getErrorCode() & 0xff) == SQLITE_ERROR;
}

bool isReadOnly(SQLite::Database& sql) {
    return sqlite3_db_readonly(sql.getHandle(), "main") == 1;
}

/// SQLite takes a file that is shorter than the smallest page for an empty one.
bool isCutShort(const std::filesystem::path& file) {
    std::error_code error;
    const std::uintmax_t size = std::filesystem::file_size(file, error);
    return !error && size > 0 && size < 512;
}

std::string damageFound(SQLite::Database& sql, const std::filesystem::path& file, bool thorough) {
    const int version = sql.execAndGet("PRAGMA user_version").getInt();
    if (version > schemaVersion)
        throw Error(file.string() + ": was made by a newer version of this software (schema " +
                    std::to_string(version) + ", this one knows " + std::to_string(schemaVersion) +
                    "); use that version, or another folder with KEST_DEVICE");
    const bool fresh = version == 0 && isFresh(sql);
    if (fresh && isCutShort(file))
        return "it is cut short";
    if (!fresh && !hasTablesOf(sql, version))
        return "it is no database of a device";
    if (isReadOnly(sql)) {
        if (access(file.c_str(), W_OK) == 0)
            return "its header names an unknown format";
        throw Error(file.string() + ": cannot be written; make it and its folder writable for this user");
    }
    if (!thorough)
        return "";
    const std::string verdict = sql.execAndGet("PRAGMA integrity_check(1)").getString();
    return verdict == "ok" ? "" : oneLine(verdict, verdict.size());
}

std::string timeStamp() {
    const std::time_t now = std::time(nullptr);
    std::tm utc{};
    gmtime_r(&now, &utc);
    char text[32];
    std::strftime(text, sizeof text, "%Y%m%dT%H%M%SZ", &utc);
    return text;
}

// The database itself comes last: an old log beside a fresh database would be taken for that one's own.
constexpr const char* parts[] = {"-shm", "-wal", "-journal", ""};

std::filesystem::path unusedName(const std::filesystem::path& file) {
    const std::string base = file.string() + ".damaged-" + timeStamp();
    const auto used = [](const std::string& name) {
        return std::any_of(std::begin(parts), std::end(parts), [&](const char* part) {
            std::error_code error;
            return std::filesystem::exists(std::filesystem::symlink_status(name + part, error));
        });
    };
    std::string name = base;
    for (int number = 2; used(name); ++number)
        name = base + "-" + std::to_string(number);
    return name;
}

}  // namespace

std::string damageOf(SQLite::Database& sql, const std::filesystem::path& file, bool thorough) {
    KeepLogOnClose keep(sql);
    std::string damage;
    try {
        damage = damageFound(sql, file, thorough);
    } catch (const SQLite::Exception& failure) {
        if (!isTheFilesFault(failure))
            throw;
        damage = failure.what();
    }
    if (damage.empty())
        keep.end();
    return damage;
}

std::string setAside(const std::filesystem::path& file, const std::string& damage) {
    const std::filesystem::path aside = unusedName(file);
    for (const char* part : parts) {
        std::error_code error;
        std::filesystem::rename(file.string() + part, aside.string() + part, error);
        if (error && error != std::errc::no_such_file_or_directory)
            throw Error(file.string() + part + ": is damaged (" + damage + ") and cannot be renamed to " +
                        aside.string() + part + ": " + error.message() + "; move it away by hand");
    }
    return file.string() + ": is damaged (" + damage + "); it was renamed to " + aside.string() +
           " and the device begins with a fresh database; `sqlite3 " + aside.string() +
           " .recover` prints what can be saved of the old one";
}

}  // namespace device
