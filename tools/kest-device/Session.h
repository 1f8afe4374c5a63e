#pragma once

#include "device/Bus.h"
#include "device/Device.h"

#include <memory>
#include <stdexcept>

namespace tool {

/// Something that the command line says wrongly; ends the tool with status 2. Other failures are device::Error.
class UsageError : public std::runtime_error {
public:
    using std::runtime_error::runtime_error;
};

/// What one run of the tool works on: the device that the environment names, and its bus. Each is opened when it is
/// first asked for.
class Session {
public:
    /// Throws device::Error when the environment names no usable folder.
    const device::Folder& folder();
    /// Throws device::Error when the device cannot be opened, also when its damaged database was set aside, or was not
    /// because an application runs.
    device::Device& device();
    /// Null when the device has no bus, which it may get meanwhile.
    device::Bus* bus();
    /// Looks for the bus anew; for whoever has just started one.
    device::Bus* reconnect();
    /// The device, whose changes from now on reach its running applications.
    device::Device& connectedDevice();
    /// Closes the device and its bus; what is asked for afterwards is opened anew.
    void close();

private:
    std::unique_ptr<device::Folder> folder_;
    std::unique_ptr<device::Bus> bus_;
    std::unique_ptr<device::Device> device_;
};

}  // namespace tool
