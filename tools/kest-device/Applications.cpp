#include "Applications.h"

#include "device/BusName.h"
#include "device/Error.h"

#include <algorithm>
#include <set>

namespace tool {

namespace {

namespace fs = std::filesystem;
using namespace std::chrono_literals;

constexpr auto patience = 3s;

/// Which device the application belongs to; empty when it does not say.
std::string folderOf(const device::Bus& bus, const std::string& id) {
    try {
        return device::BusCall(bus, id, device::bus::pathOf(id), device::bus::applicationInterface, patience)
            .property("Folder");
    } catch (const device::Error&) {
        return {};
    }
}

/// Ids that may run: of what is installed, and of what is not any more but has left its preferences.
std::set<std::string> knownIds(device::Device& device) {
    std::set<std::string> ids;
    for (const device::Package& package : device.packages().all()) {
        ids.insert(package.id);
    }
    for (const std::string& id : device.preferences().applications()) {
        ids.insert(id);
    }
    return ids;
}

void addThoseOnBus(Session& session, std::vector<RunningApplication>& running) {
    const device::Bus* bus = session.bus();
    if (!bus) {
        return;
    }
    const std::string ours = session.folder().root();
    const std::set<std::string> known = knownIds(session.device());
    for (const std::string& name : device::BusName::all(*bus)) {
        if (!known.contains(name)) {
            continue;
        }
        const std::optional<int> id = device::BusName::processOf(*bus, name);
        const std::string folder = folderOf(*bus, name);
        if (id && (folder == ours || (folder.empty() && Process(*id).environment("KEST_DEVICE") == ours))) {
            running.push_back({name, Process(*id), !folder.empty()});
        }
    }
}

/// The package whose program the process runs; nullopt when it runs none of this device's.
std::optional<std::string> packageOf(device::Device& device, const Process& process) {
    const fs::path executable = process.executable();
    for (const device::Package& package : device.packages().all()) {
        std::error_code error;
        if (!package.exec.empty() && fs::weakly_canonical(package.exec, error) == executable) {
            return package.id;
        }
    }
    return std::nullopt;
}

void addThoseWithoutBus(Session& session, std::vector<RunningApplication>& running) {
    for (const Process& process : Process::withEnvironment("KEST_DEVICE", session.folder().root())) {
        const bool known = std::any_of(running.begin(), running.end(), [&](const RunningApplication& application) {
            return application.process.id() == process.id();
        });
        if (known || !process.runs()) {
            continue;
        }
        if (const std::optional<std::string> id = packageOf(session.device(), process)) {
            running.push_back({*id, process, false});
        }
    }
}

device::Error otherDevice(const std::string& folder, const std::string& application) {
    return device::Error("this bus already has the device " + folder + ", which runs " + application +
                         "; end it with 'KEST_DEVICE=" + folder + " kest-device stop' first");
}

}  // namespace

std::vector<RunningApplication> runningApplications(Session& session) {
    std::vector<RunningApplication> running;
    addThoseOnBus(session, running);
    addThoseWithoutBus(session, running);
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

RunningApplication theApplication(Session& session, const std::string& id) {
    const std::vector<RunningApplication> running = runningApplications(session);
    std::vector<RunningApplication> meant;
    std::copy_if(running.begin(), running.end(), std::back_inserter(meant),
                 [&](const RunningApplication& application) { return id.empty() || application.id == id; });
    if (meant.empty()) {
        throw device::Error(id.empty()
                                ? "no application runs on this device; start one with 'kest-device start'"
                                : id + " does not run on this device; start it with 'kest-device start -- " + id + "'");
    }
    if (meant.size() > 1) {
        std::string ids;
        for (const RunningApplication& application : meant) {
            ids += (ids.empty() ? "" : ", ") + application.id;
        }
        throw device::Error("several applications run on this device (" + ids + "); name one with --app");
    }
    if (!meant.front().onBus) {
        throw device::Error(meant.front().id + " (process " + std::to_string(meant.front().process.id()) +
                            ") does not answer; end it with 'kest-device stop'");
    }
    return meant.front();
}

device::BusCall callTo(Session& session, const std::string& id, const char* interface) {
    device::Bus* bus = session.bus();
    if (!bus) {
        throw device::Error("the device has no bus; start one with 'kest-device start'");
    }
    return device::BusCall(*bus, id, device::bus::pathOf(id), interface, 20s);
}

void settle(Session& session) {
    for (const RunningApplication& application : runningApplications(session)) {
        if (application.onBus) {
            callTo(session, application.id).call("Settle");
        }
    }
}

}  // namespace tool
