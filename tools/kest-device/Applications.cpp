#include "Applications.h"

#include "Foreground.h"
#include "device/ApplicationLock.h"
#include "device/BusName.h"
#include "device/Error.h"

#include <algorithm>
#include <chrono>
#include <thread>

namespace tool {

namespace {

using namespace std::chrono_literals;

constexpr auto patience = 3s;
/// How long a command waits for an application that is on its way to the bus, or to its end.
constexpr auto longestStart = 5s;
constexpr auto longestEnd = 1s;
constexpr auto pollInterval = 50ms;

/// Which device the application belongs to; empty when it does not answer.
std::string folderOf(const device::Bus& bus, const std::string& id) {
    try {
        return device::BusCall(bus, id, device::bus::pathOf(id), device::bus::applicationInterface, patience)
            .property("Folder");
    } catch (const device::Error&) {
        return {};
    }
}

/// Those that answer on the bus and belong to this device.
void addThoseOnBus(Session& session, const std::vector<std::string>& known, std::vector<RunningApplication>& running) {
    const device::Bus* bus = known.empty() ? nullptr : session.bus();
    if (!bus) {
        return;
    }
    const std::string ours = session.folder().root();
    for (const std::string& name : device::BusName::all(*bus)) {
        if (std::find(known.begin(), known.end(), name) == known.end() || folderOf(*bus, name) != ours) {
            continue;
        }
        if (const std::optional<int> id = device::BusName::processOf(*bus, name)) {
            running.push_back({name, device::Process(*id), true});
        }
    }
}

/// The others: those that run without the bus, and those that hang.
void addThoseThatDoNotAnswer(Session& session, const std::vector<std::string>& known,
                             std::vector<RunningApplication>& running) {
    for (const std::string& id : known) {
        const bool answers = std::any_of(running.begin(), running.end(),
                                         [&](const RunningApplication& application) { return application.id == id; });
        if (answers) {
            continue;
        }
        if (const std::optional<pid_t> process = device::ApplicationLock::holder(session.folder(), id)) {
            running.push_back({id, device::Process(*process), false});
        }
    }
}

device::Error otherDevice(const std::string& folder, const std::string& application) {
    return device::Error("this bus already has the device " + folder + ", which runs " + application +
                         "; end it with 'KEST_DEVICE=" + folder + " kest-device stop' first");
}

/// As the command line names it, or not.
void requireIdOrNone(const std::string& id) {
    if (!id.empty()) {
        requireApplicationId(id);
    }
}

RunningApplication theOneMeant(Session& session, const std::string& id) {
    if (const std::optional<RunningApplication> meant = findApplication(session, id)) {
        return *meant;
    }
    throw doesNotRun(id);
}

}  // namespace

void requireApplicationId(const std::string& id) {
    if (const std::string fault = device::BusName::faultOf(id); !fault.empty()) {
        throw UsageError('"' + id + "\" is no application id: " + fault);
    }
}

std::string nameOf(const RunningApplication& application) {
    return application.id + " (process " + std::to_string(application.process.id()) + ")";
}

std::vector<RunningApplication> runningApplications(Session& session) {
    std::vector<RunningApplication> running;
    const std::vector<std::string> known = device::ApplicationLock::applications(session.folder());
    addThoseOnBus(session, known, running);
    addThoseThatDoNotAnswer(session, known, running);
    std::stable_sort(running.begin(), running.end(), [](const auto& a, const auto& b) { return a.id < b.id; });
    return running;
}

void requireOwnBus(Session& session, const device::Bus& bus) {
    const std::optional<std::string> owner = device::BusName::owner(bus, device::bus::deviceName);
    if (!owner) {
        return;
    }
    for (const std::string& name : device::BusName::all(bus)) {
        if (name == device::bus::deviceName || device::BusName::owner(bus, name) != owner) {
            continue;
        }
        const std::string folder = folderOf(bus, name);
        if (!folder.empty() && folder != session.folder().root()) {
            throw otherDevice(folder, name);
        }
    }
}

std::optional<RunningApplication> findApplication(Session& session, const std::string& id) {
    requireIdOrNone(id);
    const std::vector<RunningApplication> running = runningApplications(session);
    if (id.empty() && !running.empty()) {
        return inFront(session, running);
    }
    const auto meant = std::find_if(running.begin(), running.end(),
                                    [&](const RunningApplication& application) { return application.id == id; });
    return meant == running.end() ? std::nullopt : std::optional(*meant);
}

device::Error doesNotRun(const std::string& id) {
    return device::Error(id.empty()
                             ? "no application runs on this device; start one with 'kest-device start'"
                             : id + " does not run on this device; start it with 'kest-device start -- " + id + "'");
}

device::Error doesNotAnswer(const RunningApplication& application) {
    return device::Error(nameOf(application) + " does not answer; end it with 'kest-device stop'");
}

RunningApplication theApplication(Session& session, const std::string& id) {
    const auto begin = std::chrono::steady_clock::now();
    RunningApplication meant = theOneMeant(session, id);
    // One that has just been launched is in front before it can answer, and one that ends for a while after it could.
    while (!meant.onBus) {
        if (std::chrono::steady_clock::now() - begin >= (isComingUp(meant.process) ? longestStart : longestEnd)) {
            throw doesNotAnswer(meant);
        }
        std::this_thread::sleep_for(pollInterval);
        meant = theOneMeant(session, id);
    }
    return meant;
}

device::BusCall callTo(Session& session, const std::string& id, const char* interface,
                       std::chrono::milliseconds timeout) {
    device::Bus* bus = session.bus();
    if (!bus) {
        throw device::Error("the device has no bus; start one with 'kest-device start'");
    }
    return device::BusCall(*bus, id, device::bus::pathOf(id), interface, timeout);
}

void settle(Session& session) {
    std::string deaf;
    for (const RunningApplication& application : runningApplications(session)) {
        if (application.onBus) {
            callTo(session, application.id).call("Settle");
        } else {
            deaf += (deaf.empty() ? "" : ", ") + nameOf(application);
        }
    }
    if (!deaf.empty()) {
        throw device::Error("the change is made, but " + deaf +
                            " does not answer, so it may not follow before its next start; end it with "
                            "'kest-device stop'");
    }
}

}  // namespace tool
