#pragma once

#include "device/Error.h"

#include <map>
#include <optional>
#include <string>
#include <vector>

namespace device {

class Database;

/// The private key-value store of every application. Keeps no copy. All throw Error when the database fails.
class Preferences {
public:
    explicit Preferences(Database& database) : database_(database) {}

    std::optional<std::string> get(const std::string& appId, const std::string& key) const;
    void set(const std::string& appId, const std::string& key, const std::string& value);
    /// For an application, whose values belong together: as set(), until a write has failed, and from then on that
    /// failure again. A full disk would else keep the short values and lose the long ones.
    void setUnlessOneFailed(const std::string& appId, const std::string& key, const std::string& value);
    void clear(const std::string& appId);
    /// What a customisation reset does: every application starts anew.
    void clearAll();
    std::map<std::string, std::string> all(const std::string& appId) const;
    /// The applications that have stored something, in alphabetical order.
    std::vector<std::string> applications() const;

private:
    Database& database_;
    std::optional<Error> failure_;
};

}  // namespace device
