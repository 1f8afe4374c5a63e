#pragma once

#include "device/LaunchRequest.h"

#include <string>
#include <vector>

namespace device {

class Database;

/// What has come of a launch request.
enum class LaunchOutcome {
    Asked,       ///< nothing is known yet, or will be: whoever asked ended before there was an answer
    Started,     ///< the application was started with it
    HandedOver,  ///< the application, which ran already, has it
    Failed,
};

/// A launch request as the device remembers it.
struct LaunchRecord {
    long long id = 0;  ///< given by the device, from 1, never reused
    std::string time;  ///< UTC, ISO 8601 with milliseconds; given by the device
    LaunchRequest request;
    LaunchOutcome outcome = LaunchOutcome::Asked;
    std::string reason;  ///< why it failed, one line; else empty
};

/// The launch requests that were made on the device, in the order in which they came. All throw Error when the
/// database fails.
class Launches {
public:
    explicit Launches(Database& database) : database_(database) {}

    /// Stores a request with what has come of it so far, and returns its id.
    long long append(const LaunchRequest& request, LaunchOutcome outcome, const std::string& reason = {});
    /// Stores what has come of it meanwhile.
    void update(long long id, LaunchOutcome outcome, const std::string& reason = {});
    std::vector<LaunchRecord> all() const;

    /// "asked", "started", "handed over" or "failed": how it is stored, and shown to people.
    static const char* nameOf(LaunchOutcome outcome);

private:
    Database& database_;
};

}  // namespace device
