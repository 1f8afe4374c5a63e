#include "device/Preferences.h"

#include "device/Database.h"

namespace device {

std::optional<std::string> Preferences::get(const std::string& appId, const std::string& key) const {
    return database_.guarded([&]() -> std::optional<std::string> {
        const auto row = database_.query("SELECT value FROM preference WHERE app_id = ? AND key = ?", appId, key);
        if (!row->executeStep())
            return std::nullopt;
        return row->getColumn(0).getString();
    });
}

void Preferences::set(const std::string& appId, const std::string& key, const std::string& value) {
    database_.guarded([&] {
        database_
            .query("INSERT INTO preference (app_id, key, value) VALUES (?, ?, ?) "
                   "ON CONFLICT DO UPDATE SET value = excluded.value",
                   appId, key, value)
            ->exec();
    });
}

void Preferences::setUnlessOneFailed(const std::string& appId, const std::string& key, const std::string& value) {
    if (failure_)
        throw Error(*failure_);
    try {
        set(appId, key, value);
    } catch (const Error& failure) {
        failure_ = failure;
        throw;
    }
}

void Preferences::clear(const std::string& appId) {
    database_.guarded([&] { database_.query("DELETE FROM preference WHERE app_id = ?", appId)->exec(); });
}

void Preferences::clearAll() {
    database_.guarded([&] { database_.query("DELETE FROM preference")->exec(); });
}

std::map<std::string, std::string> Preferences::all(const std::string& appId) const {
    return database_.guarded([&] {
        std::map<std::string, std::string> values;
        const auto row = database_.query("SELECT key, value FROM preference WHERE app_id = ?", appId);
        while (row->executeStep())
            values.emplace(row->getColumn(0).getString(), row->getColumn(1).getString());
        return values;
    });
}

std::vector<std::string> Preferences::applications() const {
    return database_.guarded([&] {
        std::vector<std::string> ids;
        const auto row = database_.query("SELECT DISTINCT app_id FROM preference ORDER BY app_id");
        while (row->executeStep())
            ids.push_back(row->getColumn(0).getString());
        return ids;
    });
}

}  // namespace device
