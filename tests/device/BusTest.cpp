#include "device/Bus.h"

#include "SilentConnection.h"
#include "device/BusName.h"
#include "support/Message.h"
#include "support/PrivateBus.h"

#include <gmock/gmock.h>
#include <gtest/gtest.h>

namespace {

using device::BusName;
using device::Folder;
using support::Environment;
using support::messageOf;
using support::PrivateBus;
using support::runLoopUntil;
using support::TemporaryFolder;
using support::writeFile;

TEST(Bus, IsTheSessionBusWhereThereIsOne) {
    const PrivateBus daemon;
    const TemporaryFolder folder;
    const auto bus = connectSilently(Folder(folder.path()));
    ASSERT_NE(bus, nullptr);
    EXPECT_TRUE(bus->isAlive());
    EXPECT_EQ(bus->folder().root(), folder.path());
}

TEST(Bus, IsTheOneThatTheFolderNamesWhereThereIsNoSessionBus) {
    const PrivateBus daemon(false);
    const TemporaryFolder folder;
    writeFile(folder.path() / "bus.address", daemon.address() + "\n");
    EXPECT_NE(connectSilently(Folder(folder.path())), nullptr);
}

TEST(Bus, IsTheOneThatTheFolderNamesWhereTheSessionBusHasGone) {
    const PrivateBus daemon(false);
    const TemporaryFolder folder;
    const Environment session("DBUS_SESSION_BUS_ADDRESS", "unix:path=" + (folder.path() / "gone").string());
    writeFile(folder.path() / "bus.address", daemon.address() + "\n");
    EXPECT_NE(connectSilently(Folder(folder.path())), nullptr);
}

TEST(Bus, IsMissingWithoutNoiseWhereNothingNamesOne) {
    const Environment session("DBUS_SESSION_BUS_ADDRESS", std::nullopt);
    const TemporaryFolder folder;
    EXPECT_EQ(connectSilently(Folder(folder.path())), nullptr);
}

TEST(Bus, IsMissingWithoutNoiseForEveryAddressThatLeadsNowhere) {
    const TemporaryFolder folder;
    const std::string there = folder.path().string();
    writeFile(folder.path() / "file", "no socket");
    for (const std::string& address :
         {"unix:path=" + there + "/none", "unix:path=" + there + "/file", "unix:abstract=device-test-nobody" + there,
          std::string("autolaunch:"), std::string("tcp:host=127.0.0.1,port=1"), std::string("nonsense"),
          std::string("unix:"), std::string(), "unix:path=/" + std::string(5000, 'x'), std::string("unix:path=%zz")}) {
        const Environment session("DBUS_SESSION_BUS_ADDRESS", address);
        EXPECT_EQ(connectSilently(Folder(folder.path())), nullptr) << address;
    }
}

TEST(Bus, IsMissingWithoutNoiseWhereItTakesOtherUsersOnly) {
    const PrivateBus refusing(true, "ANONYMOUS");
    const TemporaryFolder folder;
    EXPECT_EQ(connectSilently(Folder(folder.path())), nullptr);
}

TEST(Bus, IsMissingWithoutNoiseWhereAnotherBusHasTakenItsPlace) {
    const PrivateBus daemon;
    const std::string place = daemon.address().substr(0, daemon.address().find(','));
    const Environment session("DBUS_SESSION_BUS_ADDRESS", place + ",guid=0123456789abcdef0123456789abcdef");
    const TemporaryFolder folder;
    EXPECT_EQ(connectSilently(Folder(folder.path())), nullptr);
}

TEST(Bus, IsThePrivateOneThatTheFolderNamesAlsoWhereThereIsASessionBus) {
    const PrivateBus own(false);
    const PrivateBus session;
    const TemporaryFolder folder;
    EXPECT_FALSE(connectSilently(Folder(folder.path()))->isPrivate());
    writeFile(folder.path() / "bus.address", own.address() + "\n");
    EXPECT_TRUE(connectSilently(Folder(folder.path()))->isPrivate());
}

TEST(Bus, IsMissingAfterAShortTimeWhereItsDaemonIsStopped) {
    const PrivateBus daemon;
    daemon.stop();
    const TemporaryFolder folder;
    EXPECT_EQ(connectSilently(Folder(folder.path())), nullptr);
}

TEST(Bus, ThatIsLostSaysSoAndLetsTheProcessRunOn) {
    PrivateBus daemon;
    const TemporaryFolder folder;
    auto bus = connectSilently(Folder(folder.path()));
    ASSERT_NE(bus, nullptr);
    bool told = false;
    bus->onLost([&] {
        told = true;
        bus.reset();
    });
    daemon.kill();
    EXPECT_TRUE(runLoopUntil([&] { return told; }));
    EXPECT_EQ(bus, nullptr);
}

TEST(Bus, ThatIsLostRefusesCallsWithALine) {
    PrivateBus daemon;
    const TemporaryFolder folder;
    const auto bus = connectSilently(Folder(folder.path()));
    ASSERT_NE(bus, nullptr);
    daemon.kill();
    EXPECT_TRUE(runLoopUntil([&] { return !bus->isAlive(); }));
    EXPECT_EQ(messageOf([&] { BusName::all(*bus); }), "the device's bus has gone; start the device anew");
    EXPECT_EQ(messageOf([&] { BusName::own(*bus, "com.example.app", false); }),
              "the device's bus has gone; start the device anew");
}

TEST(Bus, ThatIsLostUnnoticedRefusesCallsWithALineToo) {
    PrivateBus daemon;
    const TemporaryFolder folder;
    const auto bus = connectSilently(Folder(folder.path()));
    ASSERT_NE(bus, nullptr);
    BusName::all(*bus);
    daemon.kill();
    EXPECT_EQ(messageOf([&] { BusName::all(*bus); }), "the device's bus has gone; start the device anew");
}

TEST(Bus, PathOfAnApplicationHasSlashesForDots) {
    EXPECT_EQ(device::bus::pathOf("com.example.my-app"), "/com/example/my_app");
}

}  // namespace
