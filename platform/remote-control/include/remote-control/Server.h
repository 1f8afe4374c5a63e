#pragma once

#include <Elementary.h>

#include "device/Link.h"

#include <functional>
#include <memory>
#include <optional>
#include <string>

namespace device {
class Bus;
}

namespace remote_control {

/// Lets other processes see and drive the screen of this application: the D-Bus object
/// `/<application id, dots as slashes>` with the interfaces com.ravella.device.Application, org.freedesktop.Application
/// and com.ravella.device.Screen. It answers from the main loop and never blocks it.
/// It asks for no bus name: that is for whoever runs the application.
class Server {
public:
    using Extras = device::Extras;
    using LaunchHandler = std::function<void(const Extras&)>;

    /// What the server asks of the application, from the main loop.
    struct Application {
        std::function<Evas_Object*()> window;  ///< its window at that time, null when there is none
        std::function<void()> quit;            ///< after the caller of Quit() was answered
        /// A launch request, after the caller was answered; none: it takes no such requests.
        LaunchHandler launch = {};
        std::optional<device::Link> link = {};  ///< how links lead into it; none: it opens no links
    };

    /// Exports the object on `bus`, which must outlive the server.
    /// Throws device::Error when the bus does not take the object.
    Server(device::Bus& bus, const std::string& appId, Application application);
    /// Withdraws the object. Requests under way are answered with an error.
    ~Server();
    Server(const Server&) = delete;
    Server& operator=(const Server&) = delete;

private:
    struct State;
    std::unique_ptr<State> state_;
};

}  // namespace remote_control
