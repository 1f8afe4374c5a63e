#include "device/Settings.h"

#include "device/Database.h"
#include "device/Events.h"

namespace device {

std::optional<std::string> Settings::get(const std::string& key) const {
    return database_.guarded([&]() -> std::optional<std::string> {
        const auto row = database_.query("SELECT value FROM setting WHERE key = ?", key);
        if (!row->executeStep())
            return std::nullopt;
        return row->getColumn(0).getString();
    });
}

void Settings::set(const std::string& key, const std::string& value) {
    database_.guarded([&] {
        database_
            .query("INSERT INTO setting (key, value) VALUES (?, ?) ON CONFLICT DO UPDATE SET value = excluded.value",
                   key, value)
            ->exec();
    });
    events_.publishSetting(key);
}

void Settings::remove(const std::string& key) {
    database_.guarded([&] { database_.query("DELETE FROM setting WHERE key = ?", key)->exec(); });
    events_.publishSetting(key);
}

std::map<std::string, std::string> Settings::all() const {
    return database_.guarded([&] {
        std::map<std::string, std::string> settings;
        const auto row = database_.query("SELECT key, value FROM setting");
        while (row->executeStep())
            settings.emplace(row->getColumn(0).getString(), row->getColumn(1).getString());
        return settings;
    });
}

}  // namespace device
