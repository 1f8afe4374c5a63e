#pragma once

#include "Session.h"
#include "device/BusCall.h"
#include "device/Error.h"
#include "device/Process.h"

#include <chrono>
#include <optional>
#include <string>
#include <vector>

namespace tool {

/// An application that runs on the device.
struct RunningApplication {
    std::string id;
    device::Process process;
    bool onBus = true;  ///< false: it runs without a bus, or does not answer on it
};

/// Throws UsageError that says which part is wrong of what can be no application's id.
void requireApplicationId(const std::string& id);

/// How people are told of it: "com.example.sample (process 4711)".
std::string nameOf(const RunningApplication& application);

/// Those of the session's device, in the order of their ids. Asks the folder and the bus, not the database, so that a
/// device whose database is damaged can be stopped.
std::vector<RunningApplication> runningApplications(Session& session);

/// Refuses a bus that already has another device: throws device::Error that names it.
void requireOwnBus(Session& session, const device::Bus& bus);

/// The application that a command about the screen means: `id`, or the one in front when it is empty. Waits a little
/// for one that is still coming up. Throws device::Error when that one does not run or does not answer.
RunningApplication theApplication(Session& session, const std::string& id);

/// The same as things stand: nullopt when it does not run, and it may not answer yet, or no longer.
std::optional<RunningApplication> findApplication(Session& session, const std::string& id);
/// What people are told when theApplication() with that id does not run.
device::Error doesNotRun(const std::string& id);
/// What people are told of one that runs but is not on the bus.
device::Error doesNotAnswer(const RunningApplication& application);

/// Calls one of the application's interfaces, com.ravella.device.Screen unless said otherwise.
device::BusCall callTo(Session& session, const std::string& id, const char* interface = device::bus::screenInterface,
                       std::chrono::milliseconds timeout = std::chrono::seconds(20));

/// Returns when the screens of all running applications have settled after a change.
/// Throws device::Error that names those that do not answer, which may not have heard of it.
void settle(Session& session);

}  // namespace tool
