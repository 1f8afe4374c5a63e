#pragma once

#include <app_control.h>

#include <device/LaunchRequest.h>

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
    /// From KEY=VALUE words, or "--dbus-activated" alone, the program's name left out.
    /// Throws std::invalid_argument, whose what() is a line for people, for other words, and for extras that nobody can
    /// pass on.
    static Words parse(int argc, const char* const* argv);

    LaunchRequest(const std::string& appId, const Extras& extras);
    ~LaunchRequest();
    LaunchRequest(const LaunchRequest&) = delete;
    LaunchRequest& operator=(const LaunchRequest&) = delete;

    app_control_h handle() const { return handle_; }

private:
    app_control_h handle_ = nullptr;
};

}  // namespace app_assist
