#include "Sender.h"

#include "Applications.h"
#include "Foreground.h"
#include "device/HandOver.h"

#include <algorithm>
#include <chrono>

namespace tool {

namespace {

using namespace std::chrono_literals;
using device::LaunchOutcome;

/// Who asks, in the device's record of launches.
constexpr char caller[] = "kest-device";

/// As much as anything can show: the application in front tells.
bool drawsIntoMemory(Session& session, const std::vector<RunningApplication>& running) {
    return !running.empty() && inFront(session, running).process.variable("ELM_ENGINE") == "buffer";
}

/// Whether the application goes on; throws when it does not answer.
bool settles(Session& session, const RunningApplication& application) {
    try {
        callTo(session, application.id).call("Settle");
        return true;
    } catch (const device::Error&) {
        if (!application.process.endsWithin(1s)) {
            throw;
        }
        return false;
    }
}

/// False when it has ended meanwhile and does not have the request.
bool handOver(Session& session, const RunningApplication& application, const LaunchRequest& request) {
    try {
        return device::handOver(session.folder(), application.id, request.extras);
    } catch (const device::Error& failure) {
        throw device::Error(nameOf(application) + " does not take the request: " + failure.what());
    }
}

Launched carryOut(Session& session, const LaunchRequest& request) {
    const device::Package package = runnablePackage(session.device(), request.appId);
    const std::vector<RunningApplication> running = runningApplications(session);
    const auto asked = std::find_if(running.begin(), running.end(), [&](const RunningApplication& application) {
        return application.id == request.appId;
    });
    if (asked != running.end() && handOver(session, *asked, request)) {
        const bool goesOn = settles(session, *asked);
        return {LaunchOutcome::HandedOver, goesOn ? std::optional(asked->process) : std::nullopt, false};
    }
    LaunchRequest started = request;
    started.headless = request.headless || drawsIntoMemory(session, running);
    requireDisplay(started.headless);
    return {LaunchOutcome::Started, startOnDevice(session, package, started), started.headless};
}

}  // namespace

Launched send(Session& session, const LaunchRequest& request) {
    device::Launches& launches = session.device().launches();
    const long long record = launches.append({caller, request.appId, request.extras}, LaunchOutcome::Asked);
    try {
        const Launched launched = carryOut(session, request);
        launches.update(record, launched.outcome);
        return launched;
    } catch (const device::Error& failure) {
        launches.update(record, LaunchOutcome::Failed, failure.what());
        throw;
    }
}

}  // namespace tool
