#include "Applications.h"
#include "Commands.h"
#include "LogFile.h"
#include "LogLine.h"
#include "device/Error.h"

#include <algorithm>
#include <chrono>
#include <sstream>
#include <thread>

namespace tool {

namespace {

using namespace std::chrono_literals;
using Clock = std::chrono::steady_clock;

constexpr auto pollInterval = 50ms;

constexpr char about[] = R"(CONDITION is one of
  text=TEXT      a text in sight equals or holds TEXT
  no-text=TEXT   no text in sight does
  view=NAME      the view of that class is in sight
  rows=NUMBER    a list in sight has that many rows, its title row included
  log=TEXT       a line of the log holds TEXT, also an earlier one
  usage=VALUE    a usage record has VALUE as one of its values
  ended          no application runs on the device any more
It is looked at until it is so; after the time-out that is an error. An application that --app names may yet come up.

Examples:
  kest-device wait-for text="Wi-Fi"
  kest-device wait-for usage=KT01 --timeout 2)";

struct Options {
    std::string condition;
    double seconds = 10;
    std::string appId;
};

bool logHolds(Session& session, const std::string& text) {
    bool found = false;
    const auto look = [&](const std::string& line) {
        found = found || withoutColours(line).find(text) != std::string::npos;
    };
    LogFile(session.folder().log().string() + ".1").readNewLines(look);
    LogFile(session.folder().log()).readNewLines(look);
    return found;
}

bool usageHas(Session& session, const std::string& value) {
    for (const device::UsageRecord& record : session.device().usage().all()) {
        for (const auto& [key, recorded] : record.values) {
            if (recorded == value) {
                return true;
            }
        }
    }
    return false;
}

/// An application that is named may be on its way.
bool answers(Session& session, const std::string& appId) {
    const std::vector<RunningApplication> running = runningApplications(session);
    return std::any_of(running.begin(), running.end(), [&](const RunningApplication& application) {
        return application.id == appId && application.onBus;
    });
}

bool holds(Session& session, const Options& options) {
    const std::size_t equals = options.condition.find('=');
    const std::string kind = options.condition.substr(0, equals);
    const std::string value = equals == std::string::npos ? "" : options.condition.substr(equals + 1);
    if (options.condition == "ended") {
        return runningApplications(session).empty();
    }
    if (kind == "log") {
        return logHolds(session, value);
    }
    if (kind == "usage") {
        return usageHas(session, value);
    }
    if (!options.appId.empty() && !answers(session, options.appId)) {
        return false;
    }
    return callTo(session, theApplication(session, options.appId).id).truth("Has", {options.condition});
}

void requireKnown(const std::string& condition) {
    const std::size_t equals = condition.find('=');
    if (condition == "ended") {
        return;
    }
    for (const char* kind : {"text", "no-text", "view", "rows", "log", "usage"}) {
        if (equals != std::string::npos && condition.substr(0, equals) == kind && equals + 1 < condition.size()) {
            return;
        }
    }
    throw UsageError("there is no condition \"" + condition +
                     "\"; there are text=TEXT, no-text=TEXT, view=NAME, rows=NUMBER, log=TEXT, usage=VALUE and ended");
}

void waitFor(Session& session, const Options& options) {
    requireKnown(options.condition);
    const auto deadline = Clock::now() + std::chrono::duration<double>(options.seconds);
    while (!holds(session, options)) {
        if (Clock::now() >= deadline) {
            std::ostringstream seconds;
            seconds << options.seconds;
            const bool away = !options.appId.empty() && !answers(session, options.appId);
            throw device::Error("still not " + options.condition + " after " + seconds.str() + " seconds" +
                                (away ? ": " + options.appId + " does not run on this device" : ""));
        }
        std::this_thread::sleep_for(pollInterval);
    }
}

}  // namespace

void addWaitFor(CLI::App& app, Session& session) {
    CLI::App* command = app.add_subcommand("wait-for", "Wait until something is so");
    const auto options = std::make_shared<Options>();
    command->add_option("condition", options->condition, "What to wait for")->type_name("CONDITION")->required();
    command->add_option("--timeout", options->seconds, "How long at most, in seconds")
        ->check(CLI::Range(0.0, 86400.0).description(""))
        ->type_name("S")
        ->capture_default_str();
    addAppOption(*command, options->appId);
    command->footer(about);
    command->callback([options, &session] { waitFor(session, *options); });
}

}  // namespace tool
