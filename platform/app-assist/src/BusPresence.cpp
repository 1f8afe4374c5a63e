#include "BusPresence.h"

#include "Guarded.h"

#include <device/BusCall.h>
#include <device/BusName.h>
#include <device/Error.h>
#include <device/HandOver.h>

#include <chrono>
#include <filesystem>
#include <utility>

namespace app_assist {

namespace bus = device::bus;
using device::BusName;

namespace {

std::string folderOf(const device::Bus& bus, const std::string& appId) {
    const device::BusCall application(bus, appId, bus::pathOf(appId), bus::applicationInterface,
                                      std::chrono::seconds(5));
    return application.property("Folder");
}

/// The application that answers for the device: the one that owns the device's name too. "" when it has just gone.
std::string answeringApplication(const device::Bus& bus) {
    const auto owner = BusName::owner(bus, bus::deviceName);
    for (const std::string& name : BusName::all(bus)) {
        if (owner && name != bus::deviceName && BusName::owner(bus, name) == owner)
            return name;
    }
    return {};
}

}  // namespace

BusPresence::BusPresence(device::Device& device, remote_control::Server::Application application)
    : device_(device), bus_(device::Bus::connect(device.folder())),
      result_(bus_ ? join(std::move(application)) : Result::NoBus) {
    if (result_ == Result::Joined)
        device_.events().connect(*bus_);
    else
        leave();
}

BusPresence::~BusPresence() {
    leave();
}

void BusPresence::requireStartingBus() const {
    if (bus_)
        device::requireStartingBus(*bus_);
}

// The names come last, the device's last of all: who finds one owned can ask its owner at once.
BusPresence::Result BusPresence::join(remote_control::Server::Application application) {
    const std::string& appId = device_.application().id;
    bus_->onLost([this] {
        dlog_print(DLOG_WARN, logTag, "the bus is gone: remote control is off");
        leave();
    });
    server_ = std::make_unique<remote_control::Server>(*bus_, appId, std::move(application));
    if (BusName::own(*bus_, appId, false) == BusName::Result::Taken)
        return isOwnFolder(folderOf(*bus_, appId)) ? Result::RunningAlready : Result::OtherDevice;
    if (BusName::own(*bus_, bus::deviceName, true) == BusName::Result::Owner)
        return Result::Joined;
    const std::string first = answeringApplication(*bus_);
    return first.empty() || isOwnFolder(folderOf(*bus_, first)) ? Result::Joined : Result::OtherDevice;
}

bool BusPresence::isOwnFolder(const std::string& folder) {
    std::error_code ignored;
    if (folder == device_.folder().root() || std::filesystem::equivalent(folder, device_.folder().root(), ignored))
        return true;
    otherFolder_ = folder;
    return false;
}

void BusPresence::leave() {
    device_.events().disconnect();
    server_.reset();
    bus_.reset();
}

}  // namespace app_assist
