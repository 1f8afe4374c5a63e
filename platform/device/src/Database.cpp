#include "device/Database.h"

#include "DatabaseFailure.h"
#include "DatabaseHealth.h"
#include "Files.h"
#include "Schema.h"
#include "device/ApplicationLock.h"
#include "device/Error.h"
#include "device/Folder.h"

#include <fcntl.h>
#include <optional>
#include <sqlite3.h>
#include <tuple>
#include <utility>

namespace device {
namespace {

constexpr int busyTimeoutInMilliseconds = 5000;

void useWriteAheadLog(SQLite::Database& sql, const std::filesystem::path& file) {
    sql.exec("PRAGMA synchronous = NORMAL");
    const std::string mode = sql.execAndGet("PRAGMA journal_mode = WAL").getString();
    if (mode != "wal")
        throw Error(file.string() + ": the file system cannot share it between processes (journal mode " + mode +
                    "); put the device on a local disk with KEST_DEVICE");
}

/// SQLite would open some of these and wait, or say only that it cannot.
void refuseWhatIsNoFile(const std::filesystem::path& file) {
    std::error_code error;
    const auto status = std::filesystem::status(file, error);
    if (std::filesystem::exists(status) && !std::filesystem::is_regular_file(status))
        throw Error(file.string() + ": is not a file; move it away, and the device begins with a fresh database");
}

/// SQLite would let everybody read it, and gives its other files the mode of this one.
void makePrivate(const std::filesystem::path& file) {
    Descriptor(open(file.c_str(), O_RDWR | O_CREAT | O_CLOEXEC | O_NOFOLLOW, 0600));
}

std::optional<std::string> applicationOn(const Folder& folder) {
    for (std::string& id : ApplicationLock::applications(folder))
        if (ApplicationLock::holder(folder, id))
            return std::move(id);
    return std::nullopt;
}

}  // namespace

Database::Query::~Query() {
    std::ignore = statement_.tryReset();
}

Database::Impatience::Impatience(Database& database, std::chrono::milliseconds patience) : database_(database) {
    sqlite3_busy_timeout(database_.sql().getHandle(), static_cast<int>(patience.count()));
}

Database::Impatience::~Impatience() {
    sqlite3_busy_timeout(database_.sql().getHandle(), busyTimeoutInMilliseconds);
}

Database::Hold::Hold(const Folder& folder) : lock_(std::make_unique<FileLock>(folder.databaseLock())) {}

Database::Hold::~Hold() = default;

Database::Database(const Folder& folder, Check check)
    : file_(folder.database()), lock_(folder.databaseLock()), suspicion_(folder.databaseSuspicion()) {
    const FileLock lock(lock_);
    refuseWhatIsNoFile(file_);
    std::error_code ignored;
    const bool thorough = check == Check::Full || std::filesystem::exists(suspicion_, ignored);
    std::string damage;
    try {
        makePrivate(file_);
        sql_ = std::make_unique<SQLite::Database>(file_.string(), SQLite::OPEN_READWRITE | SQLite::OPEN_CREATE,
                                                  busyTimeoutInMilliseconds);
        damage = damageOf(*sql_, file_, thorough);
        if (damage.empty()) {
            useWriteAheadLog(*sql_, file_);
            upgradeSchema(*sql_);
        }
    } catch (const SQLite::Exception& failure) {
        if (!tellsOfDamage(failure))
            fail(failure);
        damage = failure.what();
    }
    if (!damage.empty()) {
        sql_.reset();
        // One that runs would go on with the file that it has open, whatever its name is by then.
        if (const auto id = applicationOn(folder))
            throw DamagedInUseError(file_.string() + ": is damaged (" + damage + ") while " + *id +
                                    " runs on it; end that application, then try again");
        throw DamagedError(setAside(file_, damage));
    }
    std::filesystem::remove(suspicion_, ignored);
}

bool Database::isReplaced() const {
    const FileLock lock(lock_);
    int moved = 0;
    return sqlite3_file_control(sql_->getHandle(), "main", SQLITE_FCNTL_HAS_MOVED, &moved) == SQLITE_OK && moved != 0;
}

SQLite::Statement& Database::statement(const char* text) {
    const auto found = statements_.find(text);
    if (found != statements_.end())
        return found->second;
    return statements_.try_emplace(text, *sql_, text).first->second;
}

void Database::fail(const SQLite::Exception& failure) {
    if (tellsOfDamage(failure))
        Descriptor(open(suspicion_.c_str(), O_WRONLY | O_CREAT | O_CLOEXEC, 0600));
    throw Error(lineFor(file_, failure));
}

}  // namespace device
