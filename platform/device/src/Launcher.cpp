#include "device/Launcher.h"

#include "device/ApplicationLock.h"
#include "device/ApplicationStart.h"
#include "device/Device.h"
#include "device/Error.h"
#include "device/MainLoop.h"

#include <Ecore.h>

#include <algorithm>
#include <exception>
#include <optional>
#include <utility>

namespace device {
namespace {

using namespace std::chrono_literals;

constexpr auto databasePatience = 250ms;
/// An application that fails later than that was started all right.
constexpr auto startTime = 10s;
/// No id of an application is longer.
constexpr std::size_t longestId = 255;

/// As much of it as a record holds.
LaunchRequest shortened(LaunchRequest request) {
    if (request.size() > LaunchRequest::mostBytes) {
        request.extras.clear();
        request.appId = request.appId.substr(0, longestId);
    }
    return request;
}

}  // namespace

Launcher::~Launcher() {
    if (endHandler_)
        ecore_event_handler_del(static_cast<Ecore_Event_Handler*>(endHandler_));
}

Launcher::Result Launcher::launch(const LaunchRequest& request) {
    const Database::Impatience impatience(device_.database(), databasePatience);
    reapChildren();
    if (const std::string fault = faultOf(request); !fault.empty())
        return refuse(shortened(request), Result::Rejected, fault);
    try {
        return carryOut(request);
    } catch (const Error& failure) {
        return refuse(request, Result::Failed, failure.what());
    }
}

Launcher::Result Launcher::carryOut(const LaunchRequest& request) {
    const std::optional<Package> package = device_.packages().find(request.appId);
    if (!package)
        return refuse(request, Result::NotFound, "it is not installed");
    if (package->exec.empty())
        return refuse(request, Result::NotFound, "it has no program: its manifest names none");
    requireProgram(*package);
    watchChildren();
    ApplicationStart start;
    start.extras = request.extras;
    start.again = runs(request);
    // Failures that were planned for this process are not meant for that one.
    start.environment = {{"DEVICE_FAULTS", ""}};
    const Process process = startApplication(device_.folder(), *package, start);
    const long long id = record(request, start.again ? LaunchOutcome::Asked : LaunchOutcome::Started, "");
    children_.push_back({process, id, request, start.again, clock_()});
    return Result::Accepted;
}

Launcher::Result Launcher::refuse(const LaunchRequest& request, Result result, const std::string& reason) {
    record(request, LaunchOutcome::Failed, reason);
    device_.log().write(Log::Level::Warning, "DEVICE",
                        request.caller + " cannot launch \"" + request.appId + "\": " + reason);
    return result;
}

bool Launcher::runs(const LaunchRequest& request) const {
    // Whoever asks for itself runs; to look at its own lock would give that up.
    return request.appId == request.caller || ApplicationLock::holder(device_.folder(), request.appId).has_value() ||
           std::any_of(children_.begin(), children_.end(), [&](const Child& child) {
               return !child.again && child.request.appId == request.appId && child.process.runs();
           });
}

long long Launcher::record(const LaunchRequest& request, LaunchOutcome outcome, const std::string& reason) {
    try {
        return device_.launches().append(request, outcome, reason);
    } catch (const Error& failure) {
        device_.log().write(Log::Level::Error, "DEVICE", failure.what());
        return 0;
    }
}

void Launcher::update(const Child& child, LaunchOutcome outcome, const std::string& reason) {
    if (outcome == LaunchOutcome::Failed)
        device_.log().write(Log::Level::Warning, "DEVICE",
                            child.request.caller + " cannot launch \"" + child.request.appId + "\": " + reason);
    try {
        const Database::Impatience impatience(device_.database(), databasePatience);
        device_.launches().update(child.record, outcome, reason);
    } catch (const Error& failure) {
        device_.log().write(Log::Level::Error, "DEVICE", failure.what());
    }
}

/// EFL's main loop waits for every child of the process, and says how it ended.
void Launcher::watchChildren() {
    if (endHandler_)
        return;
    startMainLoop();
    endHandler_ = ecore_event_handler_add(ECORE_EXE_EVENT_DEL, whenChildEnds, this);
}

Eina_Bool Launcher::whenChildEnds(void* launcher, int, void* event) noexcept {
    auto* self = static_cast<Launcher*>(launcher);
    const auto* end = static_cast<Ecore_Exe_Event_Del*>(event);
    try {
        self->childEnded(end->pid, end->signalled ? endBySignal(end->exit_signal) : endWithStatus(end->exit_code),
                         end->exited && end->exit_code == 0);
    } catch (const std::exception& failure) {
        self->device_.log().write(Log::Level::Error, "DEVICE", failure.what());
    }
    return ECORE_CALLBACK_PASS_ON;
}

/// For a process whose main loop does not run.
void Launcher::reapChildren() {
    const std::vector<Child> children = children_;
    for (const Child& child : children)
        if (const std::optional<std::string> how = endOfChild(child.process))
            childEnded(child.process.id(), *how, *how == endWithStatus(0));
}

bool Launcher::isWaiting() {
    reapChildren();
    return !children_.empty();
}

void Launcher::childEnded(int process, const std::string& how, bool well) {
    const auto found = std::find_if(children_.begin(), children_.end(),
                                    [&](const Child& child) { return child.process.id() == process; });
    if (found == children_.end())
        return;
    const Child child = *found;
    children_.erase(found);
    if (well) {
        // Also where two processes began at the same time, and the other one was the first.
        if (child.again || runs(child.request))
            update(child, LaunchOutcome::HandedOver, "");
        return;
    }
    if (!child.again && clock_() - child.begin > startTime)
        return;
    const std::string words = lastWordsOf(device_.folder(), child.request.appId);
    update(child, LaunchOutcome::Failed, "it ended " + how + (words.empty() ? "" : "; its last words: " + words));
}

}  // namespace device
