#include "Launcher.h"

#include "Applications.h"
#include "device/ApplicationStart.h"
#include "device/BusName.h"
#include "device/Error.h"

#include <chrono>
#include <thread>

namespace tool {

namespace {

using namespace std::chrono_literals;

constexpr auto patience = 30s;

device::Error earlyEnd(const device::Folder& folder, const std::string& appId, const std::string& how) {
    const std::string words = device::lastWordsOf(folder, appId);
    const std::string rest = words.empty() ? "it said nothing; 'kest-device log' may tell why"
                                           : "its last words (of " + folder.output(appId).string() + "): " + words;
    return device::Error(appId + " ended " + how + " before it was on the screen; " + rest);
}

/// Whether the application has its name by now, in whichever process of its own.
bool isOnBus(const device::Bus& bus, const std::string& appId) {
    return device::BusName::owner(bus, appId).has_value();
}

void waitForFirstScreen(Session& session, const LaunchRequest& request, const device::Process& process) {
    const auto deadline = std::chrono::steady_clock::now() + patience;
    bool onBus = false;
    while (!(onBus = isOnBus(*session.bus(), request.appId)) && std::chrono::steady_clock::now() < deadline) {
        if (const std::optional<std::string> how = device::endOfChild(process)) {
            throw earlyEnd(session.folder(), request.appId, *how);
        }
        std::this_thread::sleep_for(10ms);
    }
    if (!onBus) {
        process.end();
        throw device::Error(request.appId + " did not come up within 30 seconds and was ended; its output is in " +
                            session.folder().output(request.appId).string());
    }
    try {
        callTo(session, request.appId).call("Settle");
    } catch (const device::Error&) {
        if (process.endsWithin(1s)) {
            throw earlyEnd(session.folder(), request.appId, device::endOfChild(process).value_or("by itself"));
        }
        process.end();
        throw;
    }
}

}  // namespace

device::Package runnablePackage(device::Device& device, const std::string& appId) {
    const std::optional<device::Package> package = device.packages().find(appId);
    if (!package) {
        throw device::Error(appId + " is not installed; 'kest-device packages' lists what is");
    }
    device::requireProgram(*package);
    return *package;
}

device::Process launch(Session& session, const device::Package& package, const LaunchRequest& request) {
    device::ApplicationStart start;
    start.extras = request.extras;
    if (request.headless) {
        start.environment = {{"ELM_ENGINE", "buffer"}};
    }
    device::Process process = device::startApplication(session.folder(), package, start);
    waitForFirstScreen(session, request, process);
    return process;
}

}  // namespace tool
