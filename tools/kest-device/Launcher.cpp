#include "Launcher.h"

#include "Applications.h"
#include "PrivateBus.h"
#include "device/ApplicationStart.h"
#include "device/BusName.h"
#include "device/Error.h"

#include <chrono>
#include <cstdlib>
#include <thread>

namespace tool {

namespace {

using namespace std::chrono_literals;

constexpr auto patience = 30s;

/// Whether the application has its name by now, in whichever process of its own.
bool isOnBus(const device::Bus& bus, const std::string& appId) {
    return device::BusName::owner(bus, appId).has_value();
}

/// Throws for any other end than one with status 0.
void requireGoodEnd(Session& session, const std::string& appId, const std::string& how) {
    if (how != device::endWithStatus(0)) {
        throw earlyEnd(session.folder(), appId, how);
    }
}

/// How the child ended, as soon as that can be told: its other threads may end after the one that it began with.
std::optional<std::string> endWithin(const device::Process& process, std::chrono::milliseconds time) {
    const auto deadline = std::chrono::steady_clock::now() + time;
    std::optional<std::string> how;
    while (!(how = device::endOfChild(process)) && std::chrono::steady_clock::now() < deadline) {
        std::this_thread::sleep_for(10ms);
    }
    return how;
}

/// False when the application has ended well before.
bool reachesFirstScreen(Session& session, const LaunchRequest& request, const device::Process& process) {
    const auto deadline = std::chrono::steady_clock::now() + patience;
    bool onBus = false;
    while (!(onBus = isOnBus(*session.bus(), request.appId)) && std::chrono::steady_clock::now() < deadline) {
        if (const std::optional<std::string> how = device::endOfChild(process)) {
            requireGoodEnd(session, request.appId, *how);
            return false;
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
        if (const std::optional<std::string> how = endWithin(process, 1s)) {
            requireGoodEnd(session, request.appId, *how);
            return false;
        }
        process.end();
        throw;
    }
    return true;
}

std::string idsOf(const std::vector<device::Package>& packages) {
    std::string ids;
    for (const device::Package& package : packages) {
        ids += (ids.empty() ? "" : ", ") + package.id;
    }
    return ids.empty() ? "nothing" : ids;
}

device::Process startProgram(Session& session, const device::Package& package, const LaunchRequest& request) {
    device::ApplicationStart start;
    start.extras = request.extras;
    if (request.headless) {
        start.environment = {{"ELM_ENGINE", "buffer"}};
    }
    return device::startApplication(session.folder(), package, start);
}

}  // namespace

device::Error earlyEnd(const device::Folder& folder, const std::string& appId, const std::string& how) {
    const std::string words = device::lastWordsOf(folder, appId);
    const std::string rest = words.empty() ? "it said nothing; 'kest-device log' may tell why"
                                           : "its last words (of " + folder.output(appId).string() + "): " + words;
    return device::Error(appId + " ended " + how + " before it was on the screen; " + rest);
}

LaunchRequest requestOf(const std::vector<std::string>& words) {
    LaunchRequest request;
    request.appId = words.front();
    requireApplicationId(request.appId);
    for (std::size_t i = 1; i < words.size(); ++i) {
        const std::size_t equals = words[i].find('=');
        if (equals == 0 || equals == std::string::npos) {
            throw UsageError("extras are written KEY=VALUE; \"" + words[i] + "\" is not");
        }
        request.extras.emplace_back(words[i].substr(0, equals), words[i].substr(equals + 1));
    }
    if (const std::string fault = device::faultOf({"", request.appId, request.extras}); !fault.empty()) {
        throw UsageError(fault);
    }
    return request;
}

void requireDisplay(bool headless) {
    const auto isSet = [](const char* name) {
        const char* value = std::getenv(name);
        return value && *value;
    };
    if (!headless && !isSet("DISPLAY") && !isSet("WAYLAND_DISPLAY") && !isSet("ELM_ENGINE")) {
        throw device::Error("there is no display to open a window on; use --headless");
    }
}

device::Package runnablePackage(device::Device& device, const std::string& appId) {
    const std::optional<device::Package> package = device.packages().find(appId);
    if (!package) {
        throw device::Error(appId + " is not installed; what is: " + idsOf(device.packages().all()));
    }
    device::requireProgram(*package);
    return *package;
}

std::optional<device::Process> startOnDevice(Session& session, const device::Package& package,
                                             const LaunchRequest& request) {
    const bool startsBus = !session.bus();
    const auto stopBus = [&] {
        if (startsBus) {
            PrivateBus(session.folder()).stop();
        }
    };
    if (startsBus) {
        PrivateBus(session.folder()).start();
    }
    try {
        if (startsBus && !session.reconnect()) {
            throw device::Error("the bus of the device does not answer");
        }
        requireOwnBus(session, *session.bus());
        const device::Process process = startProgram(session, package, request);
        if (reachesFirstScreen(session, request, process)) {
            return process;
        }
    } catch (...) {
        stopBus();
        throw;
    }
    stopBus();
    return std::nullopt;
}

}  // namespace tool
