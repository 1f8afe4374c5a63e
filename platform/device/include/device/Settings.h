#pragma once

#include <map>
#include <optional>
#include <string>

namespace device {

class Database;
class Events;

/// The device's settings (vconf): string values by key, shared by all applications.
/// Keeps no copy: every call reads or writes the database. All throw Error when the database fails.
class Settings {
public:
    Settings(Database& database, Events& events) : database_(database), events_(events) {}

    /// nullopt when the key was never set.
    std::optional<std::string> get(const std::string& key) const;
    /// Stores the value, then publishes the change (also when the value is the old one).
    void set(const std::string& key, const std::string& value);
    void remove(const std::string& key);
    std::map<std::string, std::string> all() const;

private:
    Database& database_;
    Events& events_;
};

}  // namespace device
