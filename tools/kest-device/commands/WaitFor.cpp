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
/// What an application has for its answer at least.
constexpr auto answerTime = std::chrono::milliseconds(3000);

constexpr char about[] = R"(CONDITION is one of
  text=TEXT      a text in sight equals or holds TEXT
  no-text=TEXT   no text in sight does
  view=NAME      the view of that class is in sight
  rows=NUMBER    a list in sight has that many rows, its title row included
  log=TEXT       a line of the log holds TEXT, also an earlier one
  usage=VALUE    a usage record has VALUE as one of its values
  ended          no application runs on the device any more
It is looked at until it is so; after the time-out that is an error. An application that --app names may yet come up,
and one in front may still be on its way to the screen.

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

/// What a look at the device came to.
struct Look {
    bool holds = false;
    std::string obstacle = {};  ///< why it cannot be told yet; empty when it can
};

/// It may be on its way to the bus, or to its end.
Look lookAtScreen(Session& session, const Options& options, Clock::time_point deadline) {
    const std::optional<RunningApplication> meant = findApplication(session, options.appId);
    if (!meant && options.appId.empty()) {
        throw doesNotRun("");
    }
    if (!meant) {
        return {false, options.appId + " does not run on this device"};
    }
    if (!meant->onBus) {
        return {false, doesNotAnswer(*meant).what()};
    }
    const auto left = std::chrono::duration_cast<std::chrono::milliseconds>(deadline - Clock::now());
    try {
        const device::BusCall screen =
            callTo(session, meant->id, device::bus::screenInterface, std::max(left, answerTime));
        return {screen.truth("Has", {options.condition})};
    } catch (const device::Error&) {
        const std::optional<RunningApplication> still = findApplication(session, meant->id);
        if (still && still->onBus) {
            throw;
        }
        return {false, still ? doesNotAnswer(*still).what() : meant->id + " has ended"};
    }
}

Look look(Session& session, const Options& options, Clock::time_point deadline) {
    const std::size_t equals = options.condition.find('=');
    const std::string kind = options.condition.substr(0, equals);
    const std::string value = equals == std::string::npos ? "" : options.condition.substr(equals + 1);
    if (options.condition == "ended") {
        return {runningApplications(session).empty()};
    }
    if (kind == "log") {
        return {logHolds(session, value)};
    }
    if (kind == "usage") {
        return {usageHas(session, value)};
    }
    return lookAtScreen(session, options, deadline);
}

/// Conditions of another kind are right as they are.
void requireNumberOfRows(const std::string& condition, const std::string& value) {
    if (condition.rfind("rows=", 0) == 0 && value.find_first_not_of("0123456789") != std::string::npos) {
        throw UsageError("the condition \"" + condition + "\" needs a number after its \"=\"");
    }
}

void requireKnown(const std::string& condition) {
    const std::size_t equals = condition.find('=');
    if (condition == "ended") {
        return;
    }
    for (const char* kind : {"text", "no-text", "view", "rows", "log", "usage"}) {
        if (equals != std::string::npos && condition.substr(0, equals) == kind && equals + 1 < condition.size()) {
            requireNumberOfRows(condition, condition.substr(equals + 1));
            return;
        }
    }
    throw UsageError("there is no condition \"" + condition +
                     "\"; there are text=TEXT, no-text=TEXT, view=NAME, rows=NUMBER, log=TEXT, usage=VALUE and ended");
}

void waitFor(Session& session, const Options& options) {
    requireKnown(options.condition);
    const auto time = std::chrono::duration<double>(options.seconds);
    const auto deadline = Clock::now() + std::chrono::duration_cast<Clock::duration>(time);
    for (;;) {
        const Look found = look(session, options, deadline);
        if (found.holds) {
            return;
        }
        if (Clock::now() >= deadline) {
            std::ostringstream seconds;
            seconds << options.seconds;
            throw device::Error("still not " + options.condition + " after " + seconds.str() + " seconds" +
                                (found.obstacle.empty() ? "" : ": " + found.obstacle));
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
