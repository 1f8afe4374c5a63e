#include "DatabaseFailure.h"

#include <sqlite3.h>

namespace device {
namespace {

int kindOf(const SQLite::Exception& failure) {
    return failure.getErrorCode() & 0xff;
}

}  // namespace

bool tellsOfDamage(const SQLite::Exception& failure) {
    return kindOf(failure) == SQLITE_CORRUPT || kindOf(failure) == SQLITE_NOTADB;
}

std::string lineFor(const std::filesystem::path& file, const SQLite::Exception& failure) {
    const std::string name = file.string() + ": ";
    const std::string reason = failure.what();
    if (tellsOfDamage(failure))
        return name + "is damaged (" + reason + "); start the device anew, which sets the file aside";
    switch (kindOf(failure)) {
    case SQLITE_FULL:
        return name + "the disk is full (" + reason + "); free some space and try again";
    case SQLITE_BUSY:
    case SQLITE_LOCKED:
        return name + "is held by another process (" + reason + "); end that process and try again";
    case SQLITE_READONLY:
    case SQLITE_PERM:
    case SQLITE_AUTH:
        return name + "cannot be written (" + reason + "); make it and its folder writable for this user";
    case SQLITE_CANTOPEN:
        return name + "cannot be opened (" + reason + "); make it and its folder readable and writable for this user";
    case SQLITE_IOERR:
        return name + "cannot be read or written (" + reason + "); check that its disk is neither full nor broken";
    default:
        return name + "cannot be used (" + reason + ")";
    }
}

}  // namespace device
