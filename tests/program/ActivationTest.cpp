#include "RequestTest.h"

#include "support/Environment.h"
#include "support/PrivateBus.h"

#include <thread>

using support::BusClient;
using support::Environment;
using testing::ElementsAre;
using testing::IsEmpty;

namespace {

constexpr char desktopInterface[] = "org.freedesktop.Application";

/// Nothing runs, and the session bus starts the application for whoever asks it for something.
class StartedByTheBus : public RequestTest {
protected:
    StartedByTheBus() {
        const std::filesystem::path services = device_.folder() / "services";
        support::writeFile(services / (std::string(app) + ".service"),
                           "[D-BUS Service]\nName=" + std::string(app) + "\nExec=" KEST_PROGRAM " --dbus-activated\n");
        bus_.emplace(true, "EXTERNAL", services.string());
        device_.setEnvironment("DBUS_SESSION_BUS_ADDRESS", bus_->address());
        client_.emplace(bus_->address());
    }
    void TearDown() override { device_.run({"stop"}); }

    std::string ask(const std::string& interface, const std::string& method,
                    const std::vector<BusClient::Argument>& arguments) {
        const std::string error = client_->call(target(interface), method, arguments, true);
        if (error.empty()) {
            EXPECT_EQ(client_->call(target(device::bus::screenInterface), "Settle"), "");
        }
        return error;
    }

    const BusClient::Argument noData_ = BusClient::nothing("{sv}");
    Environment folder_{"KEST_DEVICE", device_.root().string()};
    Environment home_{"HOME", device_.folder().string()};
    Environment engine_{"ELM_ENGINE", "buffer"};
    Environment display_{"DISPLAY", std::nullopt};
    Environment wayland_{"WAYLAND_DISPLAY", std::nullopt};
    std::optional<support::PrivateBus> bus_;
    std::optional<BusClient> client_;
};

}  // namespace

TEST_F(StartedByTheBus, ShowsTheTipThatItIsLaunchedFor) {
    EXPECT_EQ(ask(device::bus::applicationInterface, "Launch", {BusClient::texts({{"appID", clockId}, {"page", "1"}})}),
              "");
    expectTipAboveTheList(clockMenu_);
}

TEST_F(StartedByTheBus, ShowsTheListWhenItIsActivated) {
    EXPECT_EQ(ask(desktopInterface, "Activate", {noData_}), "");
    EXPECT_THAT(views(), ElementsAre("KestMainView"));
    EXPECT_THAT(records(), IsEmpty());
}

TEST_F(StartedByTheBus, ShowsTheTipOfALink) {
    EXPECT_EQ(ask(desktopInterface, "Open", {BusClient::list({"kest:com.ravella.clock?page=1"}), noData_}), "");
    expectTipAboveTheList(clockMenu_);
}

TEST_F(StartedByTheBus, OpensTheLastOfSeveralLinks) {
    EXPECT_EQ(ask(desktopInterface, "Open",
                  {BusClient::list({"kest:com.ravella.settings", "kest:com.ravella.clock"}), noData_}),
              "");
    EXPECT_THAT(views(), ElementsAre("KestMainView", "KestContentView"));
    EXPECT_EQ(pageInView(), clockMenu_);
    EXPECT_EQ(records().size(), 2U);
}

TEST_F(StartedByTheBus, RefusesAnotherLinkAndShowsNothing) {
    EXPECT_EQ(ask(desktopInterface, "Open", {BusClient::list({"https://example.com/"}), noData_}),
              "com.ravella.device.Error.Failed: cannot open \"https://example.com/\": it does not begin with "
              "\"kest:\"; such a link is written kest:{appID}{?page}");
    EXPECT_THAT(views(), IsEmpty());
    EXPECT_THAT(records(), IsEmpty());
}

TEST_F(StartedByTheBus, RefusesALinkWithWhatIsNoApplicationOrNoNumberOfATip) {
    EXPECT_EQ(
        ask(desktopInterface, "Open", {BusClient::list({"kest:com.ravella.clock?page=abc"}), noData_}),
        "com.ravella.device.Error.Failed: cannot open \"kest:com.ravella.clock?page=abc\": its \"page\" is \"abc\", "
        "which does not match [0-9]+; such a link is written kest:{appID}{?page}");
    EXPECT_EQ(
        ask(desktopInterface, "Open", {BusClient::list({"kest:!!!?page=1"}), noData_}),
        "com.ravella.device.Error.Failed: cannot open \"kest:!!!?page=1\": its \"appID\" is \"!!!\", which does not "
        "match [A-Za-z_-][A-Za-z0-9_-]*(\\.[A-Za-z_-][A-Za-z0-9_-]*)+; such a link is written kest:{appID}{?page}");
    EXPECT_THAT(ask(desktopInterface, "Open", {BusClient::list({"kest:com.7up"}), noData_}),
                testing::HasSubstr("its \"appID\" is \"com.7up\", which does not match"))
        << "no application can have that name on the bus";
    EXPECT_THAT(views(), IsEmpty());
    EXPECT_THAT(records(), IsEmpty());
}

TEST_F(StartedByTheBus, IsOneHoweverManyAskAtATime) {
    std::vector<std::thread> others;
    for (int i = 0; i < 5; ++i)
        others.emplace_back([this] {
            BusClient other(bus_->address());
            other.call(target(), "Launch", {BusClient::texts({{"appID", clockId}})}, true);
        });
    for (std::thread& other : others)
        other.join();
    EXPECT_EQ(ask(desktopInterface, "Activate", {noData_}), "");
    EXPECT_NE(device_.application(), 0);
    EXPECT_THAT(views(), ElementsAre("KestMainView", "KestContentView"));
    EXPECT_EQ(records().size(), 5U);
}

TEST_F(StartedByTheBus, IsAskedItselfWhileItRuns) {
    start();
    const pid_t first = device_.application();
    EXPECT_EQ(ask(desktopInterface, "Open", {BusClient::list({"kest:com.ravella.clock"}), noData_}), "");
    EXPECT_EQ(device_.application(), first);
    EXPECT_THAT(views(), ElementsAre("KestMainView", "KestContentView"));
}

TEST_F(StartedByTheBus, AfterTheNotificationEndsAndIsStartedAnew) {
    EXPECT_EQ(client_->call(target(), "Launch", {BusClient::texts({{"LaunchingType", "addNoti"}})}, true), "");
    device_.must({"wait-for", "ended"});
    EXPECT_EQ(ask(desktopInterface, "Activate", {noData_}), "");
    EXPECT_THAT(views(), ElementsAre("KestMainView"));
}

TEST_F(StartedByTheBus, CannotReachADeviceThatKeepsToItsPrivateBus) {
    device_.setEnvironment("DBUS_SESSION_BUS_ADDRESS", std::nullopt);
    start();
    EXPECT_EQ(ask(desktopInterface, "Activate", {noData_}),
              "org.freedesktop.DBus.Error.Spawn.ChildExited: Process com.ravella.kest exited with status 1");
    EXPECT_THAT(views(), ElementsAre("KestMainView"));
}
