#include "device/Preferences.h"

#include "device/Database.h"

#include <numeric>

namespace device {
namespace {

constexpr std::size_t mostWaitingBytes = std::size_t{4} << 20;

}  // namespace

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

void Preferences::setInOrder(const std::string& appId, const std::string& key, const std::string& value) {
    if (failure_)
        throw Error(*failure_);
    try {
        writeWaiting();
        set(appId, key, value);
    } catch (const Error& failure) {
        waiting_.push_back({appId, key, value});
        waitingBytes_ += waiting_.back().size();
        if (waitingBytes_ > mostWaitingBytes) {
            failure_ = failure;
            forgetWaiting();
        }
        throw;
    }
}

void Preferences::writeWaiting() {
    if (waiting_.empty())
        return;
    const Database::Impatience impatience(database_);
    while (!waiting_.empty()) {
        const Write& first = waiting_.front();
        set(first.appId, first.key, first.value);
        waitingBytes_ -= first.size();
        waiting_.pop_front();
    }
}

void Preferences::forgetWaiting() {
    waiting_.clear();
    waitingBytes_ = 0;
}

void Preferences::finish() noexcept {
    try {
        writeWaiting();
    } catch (const std::exception&) {
        // It was said when it failed for the first time.
    }
    forgetWaiting();
}

Preferences::~Preferences() {
    finish();
}

void Preferences::clear(const std::string& appId) {
    std::erase_if(waiting_, [&](const Write& write) { return write.appId == appId; });
    waitingBytes_ = std::accumulate(waiting_.begin(), waiting_.end(), std::size_t{0},
                                    [](std::size_t bytes, const Write& write) { return bytes + write.size(); });
    database_.guarded([&] { database_.query("DELETE FROM preference WHERE app_id = ?", appId)->exec(); });
}

void Preferences::clearAll() {
    forgetWaiting();
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
