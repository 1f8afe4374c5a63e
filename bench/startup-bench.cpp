// What starting the application costs beside a bare EFL window with one list: the time from the start of the process
// to the first frame with rows in it, and the most memory up to there. Whole processes that draw into memory, in turn,
// medians. Joins the bus of its environment as the application does: to be run under one of its own.

#include "FirstFrame.h"
#include "support/TemporaryFolder.h"

#include <algorithm>
#include <array>
#include <cstdio>
#include <cstdlib>
#include <ctime>
#include <fcntl.h>
#include <filesystem>
#include <stdexcept>
#include <string>
#include <sys/wait.h>
#include <unistd.h>
#include <vector>

namespace {

struct Sample {
    double milliseconds;
    double processorMilliseconds;
    double megabytes;
};

double milliseconds(const timespec& time) {
    return static_cast<double>(time.tv_sec) * 1e3 + static_cast<double>(time.tv_nsec) / 1e6;
}

double milliseconds(const timeval& time) {
    return static_cast<double>(time.tv_sec) * 1e3 + static_cast<double>(time.tv_usec) / 1e3;
}

[[noreturn]] void become(const std::vector<std::string>& command, int told) {
    setenv("FIRST_FRAME_FD", std::to_string(told).c_str(), 1);
    setenv("LD_PRELOAD", FIRST_FRAME, 1);
    std::vector<char*> arguments;
    arguments.reserve(command.size() + 1);
    for (const std::string& word : command) {
        arguments.push_back(const_cast<char*>(word.c_str()));
    }
    arguments.push_back(nullptr);
    const int silence = open("/dev/null", O_WRONLY);
    dup2(silence, STDOUT_FILENO);
    dup2(silence, STDERR_FILENO);
    execv(arguments[0], arguments.data());
    _exit(127);
}

Sample start(const std::vector<std::string>& command) {
    int told[2];
    if (pipe(told) != 0) {
        throw std::runtime_error("no pipe");
    }
    timespec begin{};
    clock_gettime(CLOCK_MONOTONIC, &begin);
    const pid_t process = fork();
    if (process == 0) {
        close(told[0]);
        become(command, told[1]);
    }
    close(told[1]);
    bench::FirstFrame frame{};
    const bool read = ::read(told[0], &frame, sizeof frame) == sizeof frame;
    close(told[0]);
    int status = 0;
    waitpid(process, &status, 0);
    if (!read) {
        throw std::runtime_error(command.front() + " ended before its first frame");
    }
    return {milliseconds(frame.time) - milliseconds(begin),
            milliseconds(frame.usage.ru_utime) + milliseconds(frame.usage.ru_stime),
            static_cast<double>(frame.usage.ru_maxrss) / 1024};
}

struct Case {
    const char* name;
    std::vector<std::string> command;
    bool freshDevice;
    std::vector<Sample> samples;

    double median(double Sample::*value) const {
        std::vector<double> all;
        all.reserve(samples.size());
        for (const Sample& sample : samples) {
            all.push_back(sample.*value);
        }
        std::sort(all.begin(), all.end());
        return all[all.size() / 2];
    }
};

/// The bare window, with the icons that the application's list shows.
std::vector<std::string> bareWindow() {
    std::vector<std::string> command = {BARE_WINDOW};
    for (const auto& package : std::filesystem::directory_iterator(PACKAGES)) {
        for (const auto& file : std::filesystem::directory_iterator(package.path() / "shared/res")) {
            if (file.path().extension() == ".png") {
                command.push_back(file.path());
            }
        }
    }
    return command;
}

void prepareEnvironment(const std::filesystem::path& folder) {
    std::filesystem::create_directories(folder / "home");
    std::filesystem::create_directories(folder / "run");
    std::filesystem::permissions(folder / "run", std::filesystem::perms::owner_all);
    setenv("HOME", (folder / "home").c_str(), 1);
    setenv("XDG_RUNTIME_DIR", (folder / "run").c_str(), 1);
    setenv("KEST_DEVICE", (folder / "device").c_str(), 1);
    setenv("ELM_ENGINE", "buffer", 1);
    setenv("LANG", "C.UTF-8", 1);
    unsetenv("DISPLAY");
    unsetenv("WAYLAND_DISPLAY");
}

void print(const std::array<Case, 3>& cases) {
    std::printf("%-38s %8s %6s %14s %6s %8s %6s\n", "start to the first frame with rows", "ms", "ratio", "processor ms",
                "ratio", "peak MB", "ratio");
    for (const Case& each : cases) {
        const auto value = [&](double Sample::*member) { return each.median(member); };
        const auto ratio = [&](double Sample::*member) { return each.median(member) / cases[0].median(member); };
        std::printf("%-38s %8.1f %6.2f %14.1f %6.2f %8.1f %6.2f\n", each.name, value(&Sample::milliseconds),
                    ratio(&Sample::milliseconds), value(&Sample::processorMilliseconds),
                    ratio(&Sample::processorMilliseconds), value(&Sample::megabytes), ratio(&Sample::megabytes));
    }
}

int run(int rounds) {
    const support::TemporaryFolder folder;
    prepareEnvironment(folder.path());
    std::array<Case, 3> cases = {Case{"bare window with a list", bareWindow(), false, {}},
                                 Case{"application (aim: 1.30)", {APPLICATION}, false, {}},
                                 Case{"application, its device's first start", {APPLICATION}, true, {}}};
    // The first round fills the caches of the disk and of the fonts, and is not counted.
    for (int round = 0; round <= rounds; ++round) {
        for (Case& each : cases) {
            if (each.freshDevice) {
                setenv("KEST_DEVICE", (folder.path() / ("fresh" + std::to_string(round))).c_str(), 1);
            }
            const Sample sample = start(each.command);
            setenv("KEST_DEVICE", (folder.path() / "device").c_str(), 1);
            if (round > 0) {
                each.samples.push_back(sample);
            }
        }
    }
    print(cases);
    return 0;
}

}  // namespace

int main(int argc, char** argv) {
    try {
        const int rounds = argc > 1 ? std::atoi(argv[1]) : 41;
        if (rounds < 1) {
            throw std::runtime_error("usage: startup-bench [ROUNDS]");
        }
        return run(rounds);
    } catch (const std::exception& failure) {
        std::fprintf(stderr, "startup-bench: %s\n", failure.what());
        return 1;
    }
}
