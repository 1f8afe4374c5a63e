#pragma once

#include <cstddef>
#include <string>
#include <utility>
#include <vector>

namespace device {

/// Texts that go with a launch request, by their names.
using Extras = std::vector<std::pair<std::string, std::string>>;

/// What one application asks another for.
struct LaunchRequest {
    /// What a request may take in all, its extras with eight bytes more each: what both a command line and a bus carry.
    static constexpr std::size_t mostBytes = 64 * 1024;

    std::string caller;  ///< who asks: an application's id
    std::string appId;   ///< who is asked
    Extras extras;

    std::size_t size() const;
};

/// Why the request cannot be passed on as KEY=VALUE words and over a bus, one line; "" when it can.
std::string faultOf(const LaunchRequest& request);

}  // namespace device
