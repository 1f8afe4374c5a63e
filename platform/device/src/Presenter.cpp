#include "device/Presenter.h"

#include "device/Error.h"
#include "device/Folder.h"
#include "device/Log.h"

#include <algorithm>
#include <chrono>
#include <cstdlib>
#include <string>
#include <sys/stat.h>
#include <system_error>
#include <thread>
#include <unistd.h>

namespace device {
namespace {

namespace fs = std::filesystem;

/// Each costs the desktop a process and one of the few inotify instances that a user has.
constexpr std::size_t mostAtOnce = 20;

/// 0 for a text that is none.
long long numberIn(const std::string& text) {
    char* end = nullptr;
    const long long number = std::strtoll(text.c_str(), &end, 10);
    return *end == '\0' && number > 0 ? number : 0;
}

bool isOwn(const fs::path& file) {
    struct stat status = {};
    return stat(file.c_str(), &status) == 0 && status.st_uid == geteuid();
}

/// Anybody may run a program with any words, and nobody can end another user's.
std::vector<Process> processesOfThisUser() {
    std::vector<Process> processes;
    std::error_code error;
    for (fs::directory_iterator entry("/proc", error), end; !error && entry != end; entry.increment(error))
        if (const long long id = numberIn(entry->path().filename()); id > 0 && isOwn(entry->path()))
            processes.emplace_back(static_cast<int>(id));
    return processes;
}

/// The kernel has a program loaded a moment before it tells its words, by which shown() finds it.
void waitForItsWords(const Process& process) {
    constexpr int mostLooks = 1000;
    for (int look = 0; look < mostLooks && process.runs() && process.arguments().empty(); ++look)
        std::this_thread::sleep_for(std::chrono::milliseconds(1));
}

}  // namespace

void Presenter::show(long long id) {
    if (program_.empty())
        return;
    if (shown().size() >= mostAtOnce) {
        log_.write(Log::Level::Warning, "NOTIFICATION",
                   "notification " + std::to_string(id) + ": not shown on the desktop, which shows " +
                       std::to_string(mostAtOnce) + " of this device already");
        return;
    }
    try {
        Program program;
        program.words = {program_.string(), folder_.root().string(), std::to_string(id)};
        // Failures that were planned for this process are not meant for that one.
        program.environment = {{"KEST_DEVICE", folder_.root().string()}, {"DEVICE_FAULTS", ""}};
        waitForItsWords(startDetached(program));
    } catch (const Error& failure) {
        log_.write(Log::Level::Error, "NOTIFICATION",
                   "notification " + std::to_string(id) + ": not shown on the desktop: " + failure.what());
    }
}

std::vector<Presenter::Shown> Presenter::shown() const {
    std::vector<Shown> shown;
    for (const Process& process : processesOfThisUser()) {
        const std::vector<std::string> words = process.arguments();
        // Another build's program of the same name may show this device's notifications too.
        const bool isOurs = words.size() == 3 && fs::path(words[0]).filename() == program_.filename() &&
                            words[1] == folder_.root() && numberIn(words[2]) > 0;
        if (isOurs && process.runs())
            shown.push_back({numberIn(words[2]), process});
    }
    std::stable_sort(shown.begin(), shown.end(), [](const Shown& a, const Shown& b) { return a.id < b.id; });
    return shown;
}

void Presenter::takeDown(long long id) const {
    for (const Shown& each : shown())
        if (each.id == id)
            each.process.end();
}

std::vector<Presenter::Shown> Presenter::takeAllDown() const {
    std::vector<Shown> all = shown();
    for (const Shown& each : all)
        each.process.end();
    return all;
}

}  // namespace device
