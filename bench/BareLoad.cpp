#include "BareLoad.h"

#include <libxml/parser.h>

#include <memory>
#include <stdexcept>

namespace bench {
namespace {

/// The database with its journal and its table made, before the statement on the table is prepared.
SQLite::Database opened(const std::filesystem::path& file) {
    SQLite::Database sql(file.string(), SQLite::OPEN_READWRITE | SQLite::OPEN_CREATE);
    sql.exec("PRAGMA journal_mode = WAL");
    sql.exec("PRAGMA synchronous = NORMAL");
    sql.exec("CREATE TABLE preference (app_id TEXT NOT NULL, key TEXT NOT NULL, value TEXT NOT NULL, "
             "PRIMARY KEY (app_id, key))");
    return sql;
}

}  // namespace

void parseBare(const std::vector<std::filesystem::path>& files) {
    for (const auto& file : files) {
        const std::unique_ptr<xmlDoc, decltype(&xmlFreeDoc)> document(
            xmlReadFile(file.c_str(), "utf-8", XML_PARSE_RECOVER), xmlFreeDoc);
        if (!document) {
            throw std::runtime_error(file.string() + ": cannot be parsed");
        }
    }
}

BareStore::BareStore(const std::filesystem::path& file)
    : sql_(opened(file)), insert_(sql_, "INSERT INTO preference (app_id, key, value) VALUES (?, ?, ?) "
                                        "ON CONFLICT DO UPDATE SET value = excluded.value") {}

void BareStore::write(const std::map<std::string, std::string>& values) {
    for (const auto& [key, value] : values) {
        insert_.bind(1, "com.ravella.kest");
        insert_.bind(2, key);
        insert_.bind(3, value);
        insert_.exec();
        insert_.reset();
    }
}

}  // namespace bench
