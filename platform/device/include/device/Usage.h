#pragma once

#include <string>
#include <utility>
#include <vector>

namespace device {

class Database;

/// One record of the usage-log service.
struct UsageRecord {
    long long id = 0;  ///< given by the device, from 1, never reused
    std::string time;  ///< UTC, ISO 8601 with milliseconds; given by the device
    std::string uri;   ///< content URI it was inserted under
    /// The bundle's strings in the order of their keys.
    std::vector<std::pair<std::string, std::string>> values;
};

/// The device's usage records, in the order in which they came. All throw Error when the database fails.
class Usage {
public:
    explicit Usage(Database& database) : database_(database) {}

    /// Stores a record and returns its id.
    long long append(const std::string& uri, const std::vector<std::pair<std::string, std::string>>& values);
    std::vector<UsageRecord> all() const;

private:
    Database& database_;
};

}  // namespace device
