#include "Applications.h"
#include "Commands.h"
#include "FolderLock.h"
#include "Notifiers.h"
#include "PrivateBus.h"
#include "device/Error.h"

#include <iostream>

namespace tool {

namespace {

using namespace std::chrono_literals;

constexpr auto patience = 5s;

constexpr char about[] =
    R"(Asks every running application of the device to end, those too that others have launched, and ends by force what does
not within 5 seconds. Takes the device's notifications off the desktop; they stay on the device. Ends the device's
private bus, if it has one. A device on which nothing runs is left as it is.

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
    bool anything = !running.empty();
    // Again and again: one that ended may have launched another just before.
    for (; !running.empty(); running = runningApplications(session)) {
        for (const RunningApplication& application : running) {
            endApplication(session, application);
        }
    }
    // After the applications: the last one may have posted it just before.
    for (const device::Presenter::Shown& shown : takeNotificationsDown(session)) {
        std::cout << "the notifier of notification " << shown.id << " (process " << shown.process.id() << ") ended\n";
        anything = true;
    }
    if (!anything) {
        std::cout << "nothing runs on this device\n";
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
