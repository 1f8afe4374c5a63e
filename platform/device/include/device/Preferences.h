#pragma once

#include "device/Error.h"

#include <cstddef>
#include <deque>
#include <map>
#include <optional>
#include <string>
#include <vector>

namespace device {

class Database;

/// The private key-value store of every application. What the database holds is not copied here; what it could not
/// take from setInOrder() waits here. All throw Error when the database fails.
class Preferences {
public:
    explicit Preferences(Database& database) : database_(database) {}
    ~Preferences();
    Preferences(const Preferences&) = delete;
    Preferences& operator=(const Preferences&) = delete;

    std::optional<std::string> get(const std::string& appId, const std::string& key) const;
    void set(const std::string& appId, const std::string& key, const std::string& value);
    /// For an application, whose values belong together: as set(), but nothing overtakes a write that failed. It is
    /// tried again with the next one, without waiting for other processes, and by finish(), also when this is
    /// destroyed. A full disk would else keep the short values and lose the long ones. After 4 MiB of failed writes
    /// nothing is written more.
    void setInOrder(const std::string& appId, const std::string& key, const std::string& value);
    /// Writes what waits, or forgets it: before another process may be the application.
    void finish() noexcept;
    void clear(const std::string& appId);
    /// What a customisation reset does: every application starts anew.
    void clearAll();
    std::map<std::string, std::string> all(const std::string& appId) const;
    /// The applications that have stored something, in alphabetical order.
    std::vector<std::string> applications() const;

private:
    struct Write {
        std::string appId;
        std::string key;
        std::string value;
        std::size_t size() const { return appId.size() + key.size() + value.size(); }
    };

    void writeWaiting();
    void forgetWaiting();

    Database& database_;
    std::deque<Write> waiting_;
    std::size_t waitingBytes_ = 0;
    /// Set once more had failed than is kept.
    std::optional<Error> failure_;
};

}  // namespace device
