#include "Schema.h"

#include "device/Keys.h"

#include <SQLiteCpp/SQLiteCpp.h>

#include <iterator>
#include <string>
#include <utility>

namespace device {
namespace {

/// What makes each version of the one before it, and how many tables there are then.
struct Step {
    const char* statements;
    int tables;
};

constexpr Step steps[] = {
    {R"(
CREATE TABLE setting (key TEXT PRIMARY KEY NOT NULL, value TEXT NOT NULL);
CREATE TABLE preference (app_id TEXT NOT NULL, key TEXT NOT NULL, value TEXT NOT NULL, PRIMARY KEY (app_id, key));
CREATE TABLE package (id TEXT PRIMARY KEY NOT NULL, state TEXT NOT NULL CHECK (state IN ('installed', 'removed')));
CREATE TABLE usage (
    id INTEGER PRIMARY KEY AUTOINCREMENT, time TEXT NOT NULL, uri TEXT NOT NULL, record TEXT NOT NULL);
)",
     4},
    {R"(
CREATE TABLE launch (
    id INTEGER PRIMARY KEY AUTOINCREMENT, time TEXT NOT NULL, caller TEXT NOT NULL, app_id TEXT NOT NULL,
    extras TEXT NOT NULL, outcome TEXT NOT NULL, reason TEXT NOT NULL);
)",
     5},
    {R"(
CREATE TABLE notification (
    id INTEGER PRIMARY KEY AUTOINCREMENT, time TEXT NOT NULL, app_id TEXT NOT NULL, layout INTEGER NOT NULL,
    places INTEGER NOT NULL, title TEXT NOT NULL, title_id TEXT NOT NULL, content TEXT NOT NULL,
    content_id TEXT NOT NULL, icon TEXT NOT NULL, indicator_icon TEXT NOT NULL, launch_app_id TEXT NOT NULL,
    launch_extras TEXT NOT NULL);
)",
     6},
};
static_assert(std::size(steps) == schemaVersion);

int versionOf(SQLite::Database& sql) {
    return sql.execAndGet("PRAGMA user_version").getInt();
}

void storeFirstSettings(SQLite::Database& sql) {
    SQLite::Statement setting(sql, "INSERT INTO setting (key, value) VALUES (?, ?)");
    for (const auto& [key, value] :
         {std::pair(keys::language, keys::defaultLanguage), std::pair(keys::theme, keys::defaultTheme),
          std::pair(keys::screen, keys::defaultScreen)}) {
        setting.bind(1, key);
        setting.bind(2, value);
        setting.exec();
        setting.reset();
    }
}

}  // namespace

bool isFresh(SQLite::Database& sql) {
    return sql.execAndGet("SELECT count(*) FROM sqlite_schema").getInt() == 0;
}

bool hasTablesOf(SQLite::Database& sql, int version) {
    if (version < 1 || version > schemaVersion)
        return false;
    const int tables = sql.execAndGet("SELECT count(*) FROM sqlite_schema WHERE type = 'table' AND name IN "
                                      "('setting', 'preference', 'package', 'usage', 'launch', 'notification')")
                           .getInt();
    return tables == steps[version - 1].tables;
}

void upgradeSchema(SQLite::Database& sql) {
    if (versionOf(sql) == schemaVersion)
        return;
    SQLite::Transaction transaction(sql, SQLite::TransactionBehavior::IMMEDIATE);
    const int before = versionOf(sql);
    for (int version = before; version < schemaVersion; ++version)
        sql.exec(steps[version].statements);
    if (before == 0)
        storeFirstSettings(sql);
    sql.exec("PRAGMA user_version = " + std::to_string(schemaVersion));
    transaction.commit();
}

}  // namespace device
