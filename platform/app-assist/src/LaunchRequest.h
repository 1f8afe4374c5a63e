#pragma once

#include <app_control.h>

#include <device/LaunchRequest.h>
#include <device/Link.h>

#include <functional>
#include <optional>
#include <string>

namespace app_assist {

/// A launch request to this application: its extras, and the handle that the application reads them from.
class LaunchRequest {
public:
    using Extras = device::Extras;

    /// What the words of a command line say of the first request.
    struct Words {
        Extras extras;
        bool comesOverTheBus = false;  ///< it is yet to come: who asks has started this process by way of the bus
    };
    using LinkOfApplication = std::function<std::optional<device::Link>()>;
    /// From KEY=VALUE words, or alone a link into the application or "--dbus-activated", the program's name left out.
    /// `link` is asked where a word may be one, and what it throws is passed on.
    /// Throws std::invalid_argument, whose what() is a line for people, for other words, and for extras that nobody can
    /// pass on.
    static Words parse(int argc, const char* const* argv, const LinkOfApplication& link);

    LaunchRequest(const std::string& appId, const Extras& extras);
    ~LaunchRequest();
    LaunchRequest(const LaunchRequest&) = delete;
    LaunchRequest& operator=(const LaunchRequest&) = delete;

    app_control_h handle() const { return handle_; }

private:
    app_control_h handle_ = nullptr;
};

}  // namespace app_assist
