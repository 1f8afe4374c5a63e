#include "Session.h"

#include "device/Error.h"
#include "device/ToolkitFiles.h"

namespace tool {

const device::Folder& Session::folder() {
    if (!folder_) {
        folder_ = std::make_unique<device::Folder>(device::Folder::resolve());
    }
    return *folder_;
}

device::Device& Session::device() {
    if (!device_) {
        device::Device::Options options = device::Device::Options::standard();
        options.check = device::Database::Check::Full;
        try {
            device_ = std::make_unique<device::Device>(std::move(options));
        } catch (const device::DamagedInUseError& damaged) {
            throw device::Error(std::string(damaged.what()) + "; 'kest-device stop' ends it");
        }
    }
    return *device_;
}

device::Bus* Session::bus() {
    return bus_ ? bus_.get() : reconnect();
}

device::Bus* Session::reconnect() {
    // The bus is reached through EFL, which would keep files in the user's home.
    device::keepToolkitFilesIn(folder());
    bus_ = device::Bus::connect(folder());
    return bus_.get();
}

device::Device& Session::connectedDevice() {
    device::Device& opened = device();
    if (device::Bus* there = bus()) {
        opened.events().connect(*there);
    }
    return opened;
}

void Session::close() {
    device_.reset();
    bus_.reset();
}

}  // namespace tool
