#include "Foreground.h"

#include <algorithm>
#include <chrono>
#include <ctime>
#include <fstream>
#include <iomanip>
#include <sstream>
#include <unistd.h>

namespace tool {

namespace {

constexpr double longestStart = 5;

/// Seconds of the clock on the wall.
using Moment = double;

Moment now() {
    return std::chrono::duration<double>(std::chrono::system_clock::now().time_since_epoch()).count();
}

/// When the process began; 0 when that cannot be told.
Moment startOf(const device::Process& process) {
    std::ifstream stream("/proc/" + std::to_string(process.id()) + "/stat");
    std::string line;
    std::getline(stream, line);
    // The second word is the program's name in parentheses, which may hold blanks; the beginning is the 22nd.
    std::istringstream rest(line.substr(std::min(line.size(), line.rfind(')') + 1)));
    std::string word;
    for (int i = 3; i < 22; ++i) {
        rest >> word;
    }
    double ticks = 0;
    double sinceBoot = 0;
    if (!(rest >> ticks) || !(std::ifstream("/proc/uptime") >> sinceBoot)) {
        return 0;
    }
    return now() - sinceBoot + ticks / static_cast<double>(sysconf(_SC_CLK_TCK));
}

/// Of a time as the device writes it, "2024-05-01T12:00:00.123Z"; 0 when it is none.
Moment momentOf(const std::string& time) {
    std::istringstream stream(time);
    std::tm parts{};
    double fraction = 0;
    if (!(stream >> std::get_time(&parts, "%Y-%m-%dT%H:%M:%S"))) {
        return 0;
    }
    stream >> fraction;
    return static_cast<double>(timegm(&parts)) + fraction;
}

Moment lastHandOver(const std::vector<device::LaunchRecord>& launches, const std::string& id) {
    Moment last = 0;
    for (const device::LaunchRecord& record : launches) {
        if (record.request.appId == id && record.outcome == device::LaunchOutcome::HandedOver) {
            last = std::max(last, momentOf(record.time));
        }
    }
    return last;
}

}  // namespace

const RunningApplication& inFront(Session& session, const std::vector<RunningApplication>& running) {
    const RunningApplication* front = &running.front();
    if (running.size() == 1) {
        return *front;
    }
    const std::vector<device::LaunchRecord> launches = session.device().launches().all();
    Moment latest = -1;
    for (const RunningApplication& application : running) {
        const Moment launched = std::max(startOf(application.process), lastHandOver(launches, application.id));
        if (launched > latest) {
            latest = launched;
            front = &application;
        }
    }
    return *front;
}

bool isComingUp(const device::Process& process) {
    return now() - startOf(process) < longestStart;
}

}  // namespace tool
