// What starting the application costs beside a bare EFL window with one list: the time from the start of the process
// to the first frame with rows in it, and the most memory up to there. Whole processes that draw into memory, in turn,
// medians. Joins the bus of its environment as the application does: to be run under one of its own.

#include "FirstFrame.h"
#include "Measure.h"
#include "Program.h"
#include "Statistics.h"
#include "support/TemporaryFolder.h"

#include <array>
#include <cstdio>
#include <cstdlib>
#include <cstring>
#include <ctime>
#include <filesystem>
#include <stdexcept>
#include <string>
#include <utility>
#include <vector>

namespace {

struct Sample {
    double milliseconds;
    double processorMilliseconds;
    double megabytes;
};

double milliseconds(const timeval& time) {
    return static_cast<double>(time.tv_sec) * 1e3 + static_cast<double>(time.tv_usec) / 1e3;
}

Sample start(const std::vector<std::string>& command) {
    timespec begin{};
    clock_gettime(CLOCK_MONOTONIC, &begin);
    const std::string told = bench::toldBy(command, FIRST_FRAME);
    bench::FirstFrame frame{};
    if (told.size() != sizeof frame) {
        throw std::runtime_error(command.front() + " ended before its first frame");
    }
    std::memcpy(&frame, told.data(), sizeof frame);
    return {bench::milliseconds(frame.time) - bench::milliseconds(begin),
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
        return bench::median(std::move(all));
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
    bench::prepareEnvironment(folder.path());
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
