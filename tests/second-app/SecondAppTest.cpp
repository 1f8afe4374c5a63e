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

namespace {

constexpr char second[] = "com.example.second";
constexpr char third[] = "com.example.third";

/// Waits, in real time, for what another process does; false when it does not within a time that it never needs.
bool waitUntil(const std::function<bool()>& done) {
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

TEST_F(SecondAppOnABus, ShowsItsListAndSaysNothing) {
    auto app = start();
    const auto on = device::Bus::connect(device::Folder(folder()));
    ASSERT_TRUE(on);
    ASSERT_TRUE(isUp(*on, second)) << app->said();
    const std::string tree = screen(*on, second).text("Tree");
    EXPECT_THAT(tree, testing::HasSubstr("Drinks"));
    EXPECT_LT(tree.find("Tea"), tree.find("Coffee"));
    const fs::path picture = home_.path() / "drinks.png";
    screen(*on, second).call("Screenshot", {picture.string()});
    EXPECT_GT(fs::file_size(picture), 1000u);
    EXPECT_EQ(0, app->terminate());
    EXPECT_EQ("", app->said());
}

TEST_F(SecondAppOnABus, AnswersForItsDeviceAndEndsWhenAsked) {
    auto app = start();
    const auto on = device::Bus::connect(device::Folder(folder()));
    ASSERT_TRUE(on && isUp(*on, second));
    const device::BusCall application(*on, second, bus::pathOf(second), bus::applicationInterface);
    EXPECT_EQ(folder().string(), application.property("Folder"));
    EXPECT_EQ(device::BusName::owner(*on, second), device::BusName::owner(*on, bus::deviceName));
    application.call("Quit");
    EXPECT_EQ(0, app->wait());
    EXPECT_EQ(std::nullopt, device::BusName::owner(*on, second));
}

TEST_F(SecondAppOnABus, StartedTwiceSaysSoAndLeavesTheFirstAlone) {
    auto first = start();
    const auto on = device::Bus::connect(device::Folder(folder()));
    ASSERT_TRUE(on && isUp(*on, second));
    auto again = start();
    EXPECT_EQ(0, again->wait());
    EXPECT_EQ("second-app: com.example.second is running already\n", again->said());
    EXPECT_TRUE(screen(*on, second).truth("Has", {"text=Tea"}));
    EXPECT_EQ(0, first->terminate());
}

TEST_F(SecondAppOnABus, SharesItsDeviceWithAnotherApplication) {
    auto app = start();
    const auto on = device::Bus::connect(device::Folder(folder()));
    ASSERT_TRUE(on && isUp(*on, second));
    const auto answering = device::BusName::owner(*on, bus::deviceName);
    auto other = start(third);
    ASSERT_TRUE(isUp(*on, third)) << other->said();
    EXPECT_EQ(answering, device::BusName::owner(*on, bus::deviceName));
    EXPECT_EQ(0, app->terminate());
    EXPECT_TRUE(
        waitUntil([&] { return device::BusName::owner(*on, bus::deviceName) == device::BusName::owner(*on, third); }));
    EXPECT_EQ(0, other->terminate());
    EXPECT_EQ("", other->said());
}

TEST_F(SecondAppOnABus, RefusesTheBusOfAnotherDevice) {
    auto app = start();
    const auto on = device::Bus::connect(device::Folder(folder()));
    ASSERT_TRUE(on && isUp(*on, second));
    const fs::path elsewhere = home_.path() / "elsewhere";
    Environment other("KEST_DEVICE", elsewhere.string());
    for (const char* id : {second, third}) {
        auto refused = start(id);
        EXPECT_EQ(1, refused->wait());
        EXPECT_EQ("second-app: error: the bus belongs to the device in " + folder().string() + ", not to the one in " +
                      elsewhere.string() + "; give each device a bus of its own\n",
                  refused->said());
    }
    EXPECT_EQ(0, app->terminate());
}

TEST_F(SecondAppOnABus, RunsOnWhenTheBusGoes) {
    auto app = start();
    {
        const auto on = device::Bus::connect(device::Folder(folder()));
        ASSERT_TRUE(on && isUp(*on, second));
    }
    daemon_.kill();
    const device::Folder place(folder());
    EXPECT_TRUE(waitUntil([&] {
        return support::readFile(place.log()).find("the bus is gone: remote control is off") != std::string::npos;
    }));
    EXPECT_EQ(0, app->terminate());
}

TEST_F(SecondAppAlone, RunsWithoutABusAndSaysSoOnce) {
    auto app = start();
    ASSERT_TRUE(runs(*app));
    EXPECT_EQ(0, app->terminate());
    EXPECT_EQ("second-app: there is no bus: remote control is off\n", app->said());
}

TEST_F(SecondAppAlone, StartedTwiceSaysSoAndLeavesTheFirstAlone) {
    auto app = start();
    ASSERT_TRUE(runs(*app));
    auto again = start();
    EXPECT_EQ(0, again->wait());
    EXPECT_EQ("second-app: " + std::string(second) + " is running already\n", again->said());
    const std::string log = support::readFile(device::Folder(folder()).log());
    const std::size_t created = log.find("created");
    EXPECT_NE(std::string::npos, created);
    EXPECT_EQ(std::string::npos, log.find("created", created + 1)) << "the second one made no application";
    EXPECT_EQ(0, app->terminate());
}

TEST_F(SecondAppAlone, StartsAgainAfterItWasKilled) {
    auto app = start();
    ASSERT_TRUE(runs(*app));
    app->kill();
    auto again = start();
    ASSERT_TRUE(runs(*again));
    EXPECT_EQ(0, again->terminate());
}

TEST_F(SecondAppAlone, KeepsTheToolkitsFilesInTheDevice) {
    auto app = start();
    ASSERT_TRUE(runs(*app));
    EXPECT_EQ(0, app->terminate());
    EXPECT_TRUE(fs::is_empty(home_.path() / "home"));
    EXPECT_TRUE(fs::is_directory(folder() / "toolkit"));
}

TEST_F(SecondAppAlone, EndsWhereThereIsNoDisplay) {
    Environment noEngine("ELM_ENGINE", std::nullopt);
    auto app = start();
    EXPECT_EQ(1, app->wait());
    EXPECT_EQ("second-app: error: there is no display to show a window on (DISPLAY and WAYLAND_DISPLAY are not set); "
              "ELM_ENGINE=buffer draws into memory\n",
              app->said());
}

TEST_F(SecondAppAlone, RunsOnWhereTheDisplayShowsNoWindow) {
    Environment noEngine("ELM_ENGINE", std::nullopt);
    Environment unreachable("DISPLAY", (home_.path() / "no-server").string() + ":0");
    auto app = start();
    ASSERT_TRUE(runs(*app));
    EXPECT_EQ(0, app->terminate());
    EXPECT_EQ("second-app: error: no window could be made on the display\n"
              "second-app: there is no bus: remote control is off\n",
              app->said());
}

TEST_F(SecondAppAlone, RefusesAWordThatIsNoExtraBeforeThereIsADevice) {
    auto app = start(second, {"page=1", "--fast"});
    EXPECT_EQ(2, app->wait());
    EXPECT_EQ("second-app: error: '--fast' is no extra of a launch request: write KEY=VALUE\n", app->said());
    EXPECT_FALSE(fs::exists(folder()));
}

TEST_F(SecondAppAlone, SaysWhyTheDeviceCannotBeOpened) {
    support::writeFile(folder(), "no folder");
    auto app = start();
    EXPECT_EQ(1, app->wait());
    EXPECT_THAT(app->said(), testing::MatchesRegex("second-app: error: " + folder().string() + ": [^\n]+\n"));
}

}  // namespace
