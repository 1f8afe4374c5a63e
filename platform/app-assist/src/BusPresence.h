#pragma once

#include <device/Bus.h>
#include <device/Device.h>
#include <remote-control/Server.h>

#include <memory>
#include <string>

namespace app_assist {

/// The application on the device's bus: its name, its share in answering for the device, its remote control, and
/// the device's events. Leaves the bus when destroyed.
class BusPresence {
public:
    enum class Result {
        Joined,
        NoBus,           ///< the application runs on without
        RunningAlready,  ///< another process of the same device is this application
        OtherDevice,     ///< the bus belongs to another device
    };

    BusPresence(device::Device& device, remote_control::Server::Application application);
    ~BusPresence();
    BusPresence(const BusPresence&) = delete;
    BusPresence& operator=(const BusPresence&) = delete;

    Result result() const { return result_; }
    /// Throws device::Error when this process was started by another bus than the one that it is on.
    void requireStartingBus() const;
    /// The folder of the device that has the bus, where that is another one.
    const std::string& otherFolder() const { return otherFolder_; }

private:
    Result join(remote_control::Server::Application application);
    /// Whether `folder` is this device's; keeps it when it is not.
    bool isOwnFolder(const std::string& folder);
    void leave();

    device::Device& device_;
    std::unique_ptr<device::Bus> bus_;
    std::unique_ptr<remote_control::Server> server_;
    std::string otherFolder_;
    Result result_;
};

}  // namespace app_assist
