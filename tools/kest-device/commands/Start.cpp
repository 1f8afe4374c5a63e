#include "Applications.h"
#include "Commands.h"
#include "FolderLock.h"
#include "Launcher.h"
#include "Output.h"
#include "PrivateBus.h"
#include "Settings.h"
#include "device/BusName.h"
#include "device/Error.h"

#include <cstdlib>
#include <iostream>

namespace tool {

namespace {

struct Options {
    bool headless = false;
    bool json = false;
    std::string screen;
    std::vector<std::string> request;
};

constexpr char examples[] =
    R"(Without APPID the tips application starts. KEY=VALUE words are the extras of its launch request.
The application's own output goes to output/APPID.log in the device's folder.

Where the workstation has no session bus, a private one is started for the device; 'kest-device stop' ends it.
An application that runs already is left as it is, and that is an error.

Examples:
  kest-device start
  kest-device start --headless --screen 480x800
  kest-device start -- com.ravella.kest)";

/// The id and the extras that the words after "--" give. Throws UsageError.
LaunchRequest requestOf(const Options& options) {
    LaunchRequest request;
    request.headless = options.headless;
    request.appId = options.request.empty() ? DEFAULT_APP_ID : options.request.front();
    if (!device::BusName::isValid(request.appId)) {
        throw UsageError('"' + request.appId + "\" is no application id");
    }
    for (std::size_t i = 1; i < options.request.size(); ++i) {
        const std::size_t equals = options.request[i].find('=');
        if (equals == 0 || equals == std::string::npos) {
            throw UsageError("extras are written KEY=VALUE; \"" + options.request[i] + "\" is not");
        }
        request.extras.emplace_back(options.request[i].substr(0, equals), options.request[i].substr(equals + 1));
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

void requireNotRunning(Session& session, const std::string& id) {
    for (const RunningApplication& application : runningApplications(session)) {
        if (application.id == id) {
            throw device::Error(id + " runs already (process " + std::to_string(application.process.id()) +
                                "); end it with 'kest-device stop' first");
        }
    }
}

void start(Session& session, const Options& options) {
    const LaunchRequest request = requestOf(options);
    session.folder().create();
    const FolderLock lock(session.folder());
    device::Device& device = session.device();
    const device::Package package = runnablePackage(device, request.appId);
    requireDisplay(request.headless);
    requireNotRunning(session, request.appId);
    if (!options.screen.empty()) {
        storeSetting(device, "screen", options.screen);
    }

    const bool startsBus = !session.bus();
    if (startsBus) {
        PrivateBus(session.folder()).start();
    }
    try {
        if (startsBus && !session.reconnect()) {
            throw device::Error("the bus of the device does not answer");
        }
        requireOwnBus(session, *session.bus());
        const device::Process process = launch(session, package, request);
        if (options.json) {
            print({{"application", request.appId},
                   {"process", process.id()},
                   {"headless", request.headless},
                   {"folder", session.folder().root().string()}});
        } else {
            std::cout << request.appId << " runs" << (request.headless ? ", headless" : "") << " (process "
                      << process.id() << ")\n";
        }
    } catch (...) {
        if (startsBus) {
            PrivateBus(session.folder()).stop();
        }
        throw;
    }
}

}  // namespace

void addStart(CLI::App& app, Session& session) {
    CLI::App* command = app.add_subcommand("start", "Start an application on the device");
    const auto options = std::make_shared<Options>();
    command->add_flag("--headless", options->headless, "Draw into memory: no window, no display needed");
    command->add_option("--screen", options->screen, "The device's display from now on")->type_name("720x1280|480x800");
    command->add_option("request", options->request, "The application, and the extras of its launch request")
        ->type_name("-- APPID [KEY=VALUE...]");
    addJsonOption(*command, options->json);
    command->footer(examples);
    command->callback([options, &session] { start(session, *options); });
}

}  // namespace tool
