#include "Launcher.h"

#include "Applications.h"
#include "Output.h"
#include "device/BusName.h"
#include "device/Error.h"

#include <chrono>
#include <fstream>
#include <thread>
#include <unistd.h>

namespace tool {

namespace {

namespace fs = std::filesystem;
using namespace std::chrono_literals;

constexpr auto patience = 30s;

fs::path outputFile(const device::Folder& folder) {
    return folder.root() / "application.log";
}

/// What the application said last, for people to see why it ended.
std::string lastWords(const device::Folder& folder) {
    std::ifstream stream(outputFile(folder));
    std::string last;
    for (std::string line; std::getline(stream, line);) {
        if (!line.empty()) {
            last = line;
        }
    }
    return oneLine(last);
}

device::Error earlyEnd(const device::Folder& folder, const std::string& appId, const std::string& how) {
    const std::string words = lastWords(folder);
    const std::string rest = words.empty() ? "it said nothing; 'kest-device log' may tell why"
                                           : "its last words (of " + outputFile(folder).string() + "): " + words;
    return device::Error(appId + " ended " + how + " before it was on the screen; " + rest);
}

/// Whether the application has its name by now, in whichever process of its own.
bool isOnBus(const device::Bus& bus, const std::string& appId) {
    return device::BusName::owner(bus, appId).has_value();
}

void waitForFirstScreen(Session& session, const LaunchRequest& request, const Process& process) {
    const auto deadline = std::chrono::steady_clock::now() + patience;
    bool onBus = false;
    while (!(onBus = isOnBus(*session.bus(), request.appId)) && std::chrono::steady_clock::now() < deadline) {
        if (const std::optional<std::string> how = endOfChild(process)) {
            throw earlyEnd(session.folder(), request.appId, *how);
        }
        std::this_thread::sleep_for(10ms);
    }
    if (!onBus) {
        process.end();
        throw device::Error(request.appId + " did not come up within 30 seconds and was ended; its output is in " +
                            outputFile(session.folder()).string());
    }
    try {
        callTo(session, request.appId).call("Settle");
    } catch (const device::Error&) {
        if (process.endsWithin(1s)) {
            throw earlyEnd(session.folder(), request.appId, endOfChild(process).value_or("by itself"));
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
    if (package->exec.empty()) {
        throw device::Error(appId + " has no program to start: its manifest names none");
    }
    if (access(package->exec.c_str(), X_OK) != 0 || !fs::is_regular_file(package->exec)) {
        throw device::Error(appId + " cannot start: " + package->exec + " is no program");
    }
    return *package;
}

Process launch(Session& session, const device::Package& package, const LaunchRequest& request) {
    Program program;
    program.words = {package.exec};
    program.words.insert(program.words.end(), request.extras.begin(), request.extras.end());
    program.output = outputFile(session.folder());
    program.environment = {{"KEST_DEVICE", session.folder().root().string()}};
    if (request.headless) {
        program.environment.emplace_back("ELM_ENGINE", "buffer");
    }
    Process process = startDetached(program);
    waitForFirstScreen(session, request, process);
    return process;
}

}  // namespace tool
