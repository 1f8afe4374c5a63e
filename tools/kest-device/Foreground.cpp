#include "Foreground.h"

#include "device/BootClock.h"
#include "device/Error.h"

#include <algorithm>
#include <charconv>
#include <fstream>
#include <sstream>
#include <string>
#include <unistd.h>

namespace tool {

namespace {

constexpr double longestStart = 5;

/// By device::secondsSinceBoot().
using Moment = double;

/// When the process began; 0 when that cannot be told, as in a container where it would be later than now.
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
    if (!(rest >> ticks)) {
        return 0;
    }
    const Moment start = ticks / static_cast<double>(sysconf(_SC_CLK_TCK));
    return start <= device::secondsSinceBoot() ? start : 0;
}

/// What the application says of it; 0 when it has just ended.
Moment lastRequestOf(Session& session, const std::string& id) {
    try {
        const std::string text = callTo(session, id, device::bus::applicationInterface).property("LastRequest");
        Moment last = 0;
        std::from_chars(text.data(), text.data() + text.size(), last);
        return last;
    } catch (const device::Error&) {
        return 0;
    }
}

Moment launchOf(Session& session, const RunningApplication& application) {
    return application.onBus ? lastRequestOf(session, application.id) : startOf(application.process);
}

}  // namespace

const RunningApplication& inFront(Session& session, const std::vector<RunningApplication>& running) {
    const RunningApplication* front = &running.front();
    if (running.size() == 1) {
        return *front;
    }
    Moment latest = -1;
    for (const RunningApplication& application : running) {
        const Moment launched = launchOf(session, application);
        if (launched > latest) {
            latest = launched;
            front = &application;
        }
    }
    return *front;
}

bool isComingUp(const device::Process& process) {
    const Moment start = startOf(process);
    return start > 0 && device::secondsSinceBoot() - start < longestStart;
}

}  // namespace tool
