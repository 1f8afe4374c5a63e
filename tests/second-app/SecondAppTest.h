#pragma once

#include "support/Environment.h"
#include "support/PrivateBus.h"
#include "support/Process.h"
#include "support/TemporaryFolder.h"

#include <device/Bus.h>
#include <device/BusCall.h>
#include <device/BusName.h>
#include <device/Device.h>
#include <device/Keys.h>
#include <gmock/gmock.h>

#include <chrono>
#include <filesystem>
#include <functional>
#include <memory>
#include <optional>
#include <sstream>
#include <thread>

namespace fs = std::filesystem;
namespace bus = device::bus;
using support::Environment;

inline constexpr char second[] = "com.example.second";
inline constexpr char third[] = "com.example.third";

/// Waits, in real time, for what another process does; false when it does not within a time that it never needs.
inline bool waitUntil(const std::function<bool()>& done) {
    for (int attempt = 0; attempt < 2000; ++attempt) {
        if (done())
            return true;
        std::this_thread::sleep_for(std::chrono::milliseconds(10));
    }
    return false;
}

/// An application that runs as a process of its own.
class Running {
public:
    Running(const std::string& id, const fs::path& messages, const std::vector<std::string>& words)
        : messages_(messages), process_(support::Process::ofWork([&] { return become(id, messages, words); })) {}

    /// Its exit status once it has ended by itself.
    int wait() { return process_.wait(); }
    /// The same after it was asked to end.
    int terminate() {
        process_.signal(SIGTERM);
        return process_.wait();
    }
    void kill() {
        process_.signal(SIGKILL);
        process_.wait();
    }
    void signal(int number) const { process_.signal(number); }
    pid_t id() const { return process_.id(); }
    /// What it wrote on standard error, but for what EFL's frame thread prints there where the machine is busy.
    std::string said() const {
        std::istringstream lines(support::readFile(messages_));
        std::string rest;
        for (std::string line; std::getline(lines, line);)
            if (!line.starts_with("ERROR: ecore_animator thread - "))
                rest += line + "\n";
        return rest;
    }

private:
    static int become(const std::string& id, const fs::path& messages, const std::vector<std::string>& words) {
        const int file = open(messages.c_str(), O_WRONLY | O_CREAT | O_TRUNC, 0600);
        dup2(file, STDERR_FILENO);
        const std::string program = std::string(SECOND_APP_PACKAGES "/") + id + "/bin/second-app";
        std::vector<char*> argv{const_cast<char*>(program.c_str())};
        for (const std::string& word : words)
            argv.push_back(const_cast<char*>(word.c_str()));
        argv.push_back(nullptr);
        execv(argv[0], argv.data());
        return 127;
    }

    fs::path messages_;
    support::Process process_;
};

class SecondApp : public testing::Test {
protected:
    SecondApp() { fs::create_directories(home_.path() / "home"); }

    std::unique_ptr<Running> start(const std::string& id = second, const std::vector<std::string>& words = {}) {
        return std::make_unique<Running>(id, home_.path() / ("messages." + std::to_string(++started_)), words);
    }
    fs::path folder() const { return home_.path() / "device"; }

    /// Whether the device's log comes to hold the text.
    bool logs(const std::string& text) {
        return waitUntil(
            [&] { return support::readFile(device::Folder(folder()).log()).find(text) != std::string::npos; });
    }
    /// Whether its first screen stands.
    bool isUp(const device::Bus& on, const std::string& id) {
        return waitUntil([&] { return device::BusName::owner(on, id).has_value(); }) &&
               waitUntil([&] { return screen(on, id).truth("Has", {"text=Tea"}); });
    }
    static device::BusCall screen(const device::Bus& on, const std::string& id) {
        return {on, id, bus::pathOf(id), bus::screenInterface};
    }

    support::TemporaryFolder home_;
    Environment homeVariable_{"HOME", (home_.path() / "home").string()};
    Environment device_{"KEST_DEVICE", folder().string()};
    Environment engine_{"ELM_ENGINE", "buffer"};
    Environment runDirectory_{"XDG_RUNTIME_DIR", std::nullopt};
    Environment display_{"DISPLAY", std::nullopt};
    Environment wayland_{"WAYLAND_DISPLAY", std::nullopt};
    int started_ = 0;
};

class SecondAppOnABus : public SecondApp {
protected:
    support::PrivateBus daemon_;
};

class SecondAppAlone : public SecondApp {
protected:
    /// The last thing that it says before its main loop.
    static bool runs(const Running& app) {
        return waitUntil([&] { return app.said().find("remote control is off") != std::string::npos; });
    }
    Environment session_{"DBUS_SESSION_BUS_ADDRESS", std::nullopt};
};
