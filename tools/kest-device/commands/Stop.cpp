#include "Applications.h"
#include "Commands.h"
#include "FolderLock.h"
#include "PrivateBus.h"
#include "device/Error.h"

#include <iostream>

namespace tool {

namespace {

using namespace std::chrono_literals;

constexpr auto patience = 5s;

constexpr char about[] =
    R"(Asks every running application of the device to end, those too that others have launched, and ends by force what does
not within 5 seconds. Ends the device's private bus, if it has one. A device on which nothing runs is left as it is.

Example:
  kest-device stop)";

void endApplication(Session& session, const RunningApplication& application) {
    const std::string name = nameOf(application);
    bool asked = false;
    if (application.onBus) {
        try {
            callTo(session, application.id, device::bus::applicationInterface).call("Quit");
            asked = true;
        } catch (const device::Error&) {
            // It is ended by force below; that it could not be asked is no news then.
        }
    }
    if (asked && application.process.endsWithin(patience)) {
        std::cout << name << " ended\n";
        return;
    }
    application.process.end();
    std::cout << name << " did not answer and was ended by force\n";
}

void stop(Session& session) {
    if (!std::filesystem::exists(session.folder().root())) {
        std::cout << "nothing runs: there is no device " << session.folder().root().string() << " yet\n";
        return;
    }
    const FolderLock lock(session.folder());
    std::vector<RunningApplication> running = runningApplications(session);
    if (running.empty()) {
        std::cout << "nothing runs on this device\n";
    }
    // Again and again: one that ended may have launched another just before.
    for (; !running.empty(); running = runningApplications(session)) {
        for (const RunningApplication& application : running) {
            endApplication(session, application);
        }
    }
    PrivateBus(session.folder()).stop();
}

}  // namespace

void addStop(CLI::App& app, Session& session) {
    CLI::App* command = app.add_subcommand("stop", "End everything that runs on the device");
    command->footer(about);
    command->callback([&session] { stop(session); });
}

}  // namespace tool
