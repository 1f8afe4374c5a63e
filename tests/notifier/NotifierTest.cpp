#include "DesktopTest.h"
#include "device/Process.h"

namespace {

using support::Environment;
using support::FakeDaemon;
using support::Process;
using support::runLoopUntil;
using testing::ElementsAre;
using testing::IsEmpty;

/// The program, as the device starts it.
class Notifier : public DesktopTest {
protected:
    Notifier() {
        // Where that program finds them too.
        install(device_.appId());
        install(tea);
    }
    void install(const std::string& id) const {
        std::filesystem::create_directories(device_->folder().apps());
        std::filesystem::copy(device_.preinstalled() / id, device_->folder().apps() / id,
                              std::filesystem::copy_options::recursive |
                                  std::filesystem::copy_options::overwrite_existing);
    }
    Process start(const std::string& number = "1") const {
        return Process::ofProgram({NOTIFIER, device_.root().string(), number});
    }
    /// Starts it for a notification, and waits until it shows.
    Process startWell() {
        post();
        Process process = start();
        EXPECT_TRUE(runLoopUntil([this] { return logs() == std::vector{line(1, "shown on the desktop")}; }));
        return process;
    }
    std::vector<std::string> logs() const { return device_.logMessages(); }
    /// Whether it ends by itself; its parent has not waited for it then.
    static bool ends(const Process& process) {
        return runLoopUntil([&] { return !device::Process(process.id()).runs(); });
    }
    /// Runs it to its end.
    void run(const std::string& number = "1") const { EXPECT_EQ(start(number).wait(), 0); }
};

TEST_F(Notifier, ShowsItsNotificationUntilItIsClicked) {
    setProgram("echo \"$@\"\n");
    install(tea);
    FakeDaemon daemon(device_->folder());
    Process process = startWell();
    EXPECT_EQ(daemon.calls().at(0).title, "Tea");
    daemon.invoke(1);
    EXPECT_TRUE(ends(process));
    EXPECT_EQ(process.wait(), 0);
    EXPECT_THAT(kept(), IsEmpty());
    EXPECT_EQ(support::readFile(device_->folder().output(tea)), "page=walk\n");
}

TEST_F(Notifier, FollowsTheLanguage) {
    const std::unique_ptr<device::Bus> bus = device::Bus::connect(device_->folder());
    FakeDaemon daemon(device_->folder());
    const Process process = startWell();
    device_->events().connect(*bus);
    setLanguage("ko_KR.UTF-8");
    EXPECT_TRUE(runLoopUntil([&] { return daemon.calls().size() == 2; }));
    EXPECT_EQ(daemon.calls().back().title, "차");
}

TEST_F(Notifier, TakesItDownWhenItIsAskedToEnd) {
    for (const int signal : {SIGTERM, SIGINT}) {
        FakeDaemon daemon(device_->folder());
        const long long id = post();
        Process process = start(std::to_string(id));
        ASSERT_TRUE(runLoopUntil([&] { return !logs().empty() && logs().back() == line(id, "shown on the desktop"); }));
        process.signal(signal);
        EXPECT_TRUE(ends(process));
        EXPECT_EQ(process.wait(), 0);
        EXPECT_THAT(daemon.closed(), ElementsAre(1U));
        EXPECT_EQ(logs().back(), line(id, "taken off the desktop"));
    }
    EXPECT_THAT(kept(), ElementsAre(1, 2));
}

TEST_F(Notifier, EndsWithTheDevicesFolder) {
    FakeDaemon daemon(device_->folder());
    const Process process = startWell();
    std::filesystem::remove_all(device_.root());
    EXPECT_TRUE(ends(process));
    EXPECT_THAT(daemon.closed(), ElementsAre(1U));
    EXPECT_FALSE(std::filesystem::exists(device_.root()));
}

TEST_F(Notifier, DoesNotMindWhatElseGoesBesideTheFolder) {
    FakeDaemon daemon(device_->folder());
    const Process process = startWell();
    support::writeFile(device_.folder() / "beside", "");
    std::filesystem::remove(device_.folder() / "beside");
    std::filesystem::rename(device_.root(), device_.folder() / "moved");
    EXPECT_TRUE(ends(process)) << "but a folder that is moved away has gone";
    EXPECT_THAT(daemon.closed(), ElementsAre(1U));
    EXPECT_EQ(daemon.calls().size(), 1U);
}

TEST_F(Notifier, EndsWithTheBus) {
    const FakeDaemon daemon(device_->folder());
    const Process process = startWell();
    session_.kill();
    EXPECT_TRUE(ends(process));
    EXPECT_EQ(logs().back(), line(1, "the bus has gone; it stays on the device"));
}

TEST_F(Notifier, SaysOnceThatThereIsNoDaemon) {
    post();
    run();
    EXPECT_THAT(logs(), ElementsAre(line(1,
                                         "not shown on the desktop: The name org.freedesktop.Notifications was not "
                                         "provided by any .service files",
                                         'W')));
    EXPECT_THAT(kept(), ElementsAre(1));
}

TEST_F(Notifier, SaysOnceThatThereIsNoBus) {
    const Environment none("DBUS_SESSION_BUS_ADDRESS", std::nullopt);
    post();
    run();
    EXPECT_THAT(logs(), ElementsAre(line(1, "not shown on the desktop: there is no bus", 'W')));
}

TEST_F(Notifier, StartsNoDaemonOnADevicesOwnBus) {
    const Environment none("DBUS_SESSION_BUS_ADDRESS", std::nullopt);
    support::writeFile(device_->folder().busAddress(), session_.address() + "\n");
    post();
    run();
    EXPECT_THAT(logs(), ElementsAre(line(1,
                                         "not shown on the desktop: there is no notification daemon on the device's "
                                         "own bus",
                                         'W')));
}

TEST_F(Notifier, ShowsOnADevicesOwnBusWhatADaemonThereShows) {
    const Environment none("DBUS_SESSION_BUS_ADDRESS", std::nullopt);
    support::writeFile(device_->folder().busAddress(), session_.address() + "\n");
    const FakeDaemon daemon(device_->folder());
    const Process process = startWell();
    EXPECT_EQ(daemon.calls().size(), 1U);
}

TEST_F(Notifier, MakesNoDeviceAnewThatHasGone) {
    const auto gone = device_.folder() / "gone";
    std::filesystem::create_directories(gone);
    EXPECT_EQ(Process::ofProgram({NOTIFIER, gone.string(), "1"}).wait(), 0);
    EXPECT_TRUE(std::filesystem::is_empty(gone));
}

TEST_F(Notifier, HasNothingToDoForANotificationThatHasGone) {
    FakeDaemon daemon(device_->folder());
    run("4711");
    EXPECT_THAT(logs(), IsEmpty());
}

TEST_F(Notifier, SaysInTheDevicesLogThatTheDeviceCannotBeOpened) {
    post();
    device_->database().sql().exec("PRAGMA user_version = 7");
    EXPECT_EQ(start().wait(), 1);
    ASSERT_EQ(logs().size(), 1U);
    EXPECT_THAT(logs()[0], testing::StartsWith("E NOTIFICATION " + device_.root().string() + "/device.db: "));
}

TEST_F(Notifier, RefusesWhatIsNoNumber) {
    for (const char* number : {"", "0", "-1", "x", "1x"})
        EXPECT_EQ(start(number).wait(), 2) << number;
    EXPECT_EQ(Process::ofProgram({NOTIFIER}).wait(), 2);
}

}  // namespace
