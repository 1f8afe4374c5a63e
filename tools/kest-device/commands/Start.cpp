#include "Applications.h"
#include "Commands.h"
#include "FolderLock.h"
#include "Launcher.h"
#include "Output.h"
#include "Settings.h"
#include "device/Error.h"

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

void requireNotRunning(Session& session, const std::string& id) {
    for (const RunningApplication& application : runningApplications(session)) {
        if (application.id == id) {
            throw device::Error(id + " runs already (process " + std::to_string(application.process.id()) +
                                "); end it with 'kest-device stop' first");
        }
    }
}

void start(Session& session, const Options& options) {
    LaunchRequest request =
        requestOf(options.request.empty() ? std::vector<std::string>{DEFAULT_APP_ID} : options.request);
    request.headless = options.headless;
    session.folder().create();
    const FolderLock lock(session.folder());
    device::Device& device = session.device();
    const device::Package package = runnablePackage(device, request.appId);
    requireDisplay(request.headless);
    requireNotRunning(session, request.appId);
    if (!options.screen.empty()) {
        storeSetting(device, "screen", options.screen);
    }
    const std::optional<device::Process> process = startOnDevice(session, package, request);
    if (!process) {
        throw earlyEnd(session.folder(), request.appId, device::endWithStatus(0));
    }
    if (options.json) {
        print({{"application", request.appId},
               {"process", process->id()},
               {"headless", request.headless},
               {"folder", session.folder().root().string()}});
    } else {
        std::cout << request.appId << " runs" << (request.headless ? ", headless" : "") << " (process " << process->id()
                  << ")\n";
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
