#include "device/HandOver.h"

#include "device/ApplicationLock.h"
#include "device/Bus.h"
#include "device/BusCall.h"
#include "device/BusName.h"
#include "device/Error.h"
#include "device/ToolkitFiles.h"

#include <chrono>
#include <cstdlib>
#include <string_view>
#include <thread>

namespace device {
namespace {

using namespace std::chrono_literals;
using Clock = std::chrono::steady_clock;

constexpr auto startTime = 10s;
constexpr auto answerTime = 5s;
constexpr auto pollInterval = 10ms;

/// False when the application ends before it is on the bus.
bool waitForName(const Bus& bus, const Folder& folder, const std::string& appId) {
    const auto deadline = Clock::now() + startTime;
    while (!BusName::owner(bus, appId)) {
        if (!ApplicationLock::holder(folder, appId))
            return false;
        if (Clock::now() >= deadline)
            throw Error(appId + " is not on the device's bus");
        std::this_thread::sleep_for(pollInterval);
    }
    return true;
}

/// Whether it is ending: it has left the bus, and will give its lock up.
bool ends(const Bus& bus, const Folder& folder, const std::string& appId) {
    const auto deadline = Clock::now() + answerTime;
    while (ApplicationLock::holder(folder, appId)) {
        if (BusName::owner(bus, appId) || Clock::now() >= deadline)
            return false;
        std::this_thread::sleep_for(pollInterval);
    }
    return true;
}

std::unique_ptr<Bus> requireBus(const Folder& folder) {
    // The bus is reached through EFL, which would keep files in the user's home.
    keepToolkitFilesIn(folder);
    std::unique_ptr<Bus> bus = Bus::connect(folder);
    if (!bus)
        throw Error("there is no bus");
    return bus;
}

/// An address without what tells one daemon from the next at the same place.
std::string_view placeOf(std::string_view address) {
    return address.substr(0, address.find(','));
}

}  // namespace

bool handOver(const Folder& folder, const std::string& appId, const Extras& extras) {
    const std::unique_ptr<Bus> bus = requireBus(folder);
    if (!waitForName(*bus, folder, appId))
        return false;
    try {
        BusCall(*bus, appId, bus::pathOf(appId), bus::applicationInterface, answerTime).call("Launch", {extras});
        return true;
    } catch (const Error&) {
        if (ends(*bus, folder, appId))
            return false;
        throw;
    }
}

bool waitOnStartingBus(const Folder& folder, const std::string& appId) {
    const std::unique_ptr<Bus> bus = requireBus(folder);
    requireStartingBus(*bus);
    return waitForName(*bus, folder, appId);
}

void requireStartingBus(const Bus& bus) {
    const char* starter = std::getenv("DBUS_STARTER_ADDRESS");
    if (bus.isPrivate() && starter && placeOf(starter) != placeOf(bus.address()))
        throw Error("the device keeps to a private bus, on which nothing of the session's arrives; end all that runs "
                    "on the device first");
}

}  // namespace device
