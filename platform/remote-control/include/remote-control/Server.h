#pragma once

#include <Elementary.h>

#include <functional>
#include <memory>
#include <string>

namespace device {
class Bus;
}

namespace remote_control {

/// Lets other processes see and drive the screen of this application: the D-Bus object
/// `/<application id, dots as slashes>` with the interfaces com.ravella.device.Application and
/// com.ravella.device.Screen. It answers from the main loop and never blocks it.
/// It asks for no bus name: that is for whoever runs the application.
class Server {
public:
    /// Exports the object on `bus`, which must outlive the server.
    /// `window` gives the application's window at the time of a request, null when there is none.
    /// `quit` is called from the main loop, after the caller of Quit() was answered.
    /// Throws device::Error when the bus does not take the object.
    Server(device::Bus& bus, const std::string& appId, std::function<Evas_Object*()> window,
           std::function<void()> quit);
    /// Withdraws the object. Requests under way are answered with an error.
    ~Server();
    Server(const Server&) = delete;
    Server& operator=(const Server&) = delete;

private:
    struct State;
    std::unique_ptr<State> state_;
};

}  // namespace remote_control
