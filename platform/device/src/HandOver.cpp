#include "device/HandOver.h"

#include "device/ApplicationLock.h"
#include "device/Bus.h"
#include "device/BusCall.h"
#include "device/BusName.h"
#include "device/Error.h"
#include "device/ToolkitFiles.h"

#include <chrono>
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

}  // namespace

bool handOver(const Folder& folder, const std::string& appId,
              const std::vector<std::pair<std::string, std::string>>& extras) {
    // The bus is reached through EFL, which would keep files in the user's home.
    keepToolkitFilesIn(folder);
    const std::unique_ptr<Bus> bus = Bus::connect(folder);
    if (!bus)
        throw Error("there is no bus");
    if (!waitForName(*bus, folder, appId))
        return false;
    try {
        BusCall(*bus, appId, bus::pathOf(appId), bus::applicationInterface, answerTime).call("Launch", {extras});
        return true;
    } catch (const Error&) {
        if (!ApplicationLock::holder(folder, appId))
            return false;
        throw;
    }
}

}  // namespace device
