#include "device/Bus.h"

#include "device/BusCall.h"
#include "device/BusName.h"
#include "device/Error.h"
#include "support/Message.h"
#include "support/PrivateBus.h"
#include "support/TemporaryDevice.h"

#include <gmock/gmock.h>
#include <gtest/gtest.h>

namespace {

using device::Bus;
using device::BusCall;
using device::BusName;
using device::Folder;
using support::Environment;
using support::messageOf;
using support::PrivateBus;
using support::Process;
using support::runLoopUntil;
using support::TemporaryFolder;
using support::writeFile;

/// Connects, and fails the test when that prints anything.
std::unique_ptr<Bus> connectSilently(const Folder& folder) {
    testing::internal::CaptureStderr();
    auto bus = Bus::connect(folder);
    EXPECT_EQ(testing::internal::GetCapturedStderr(), "");
    return bus;
}

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

/// Two connections of this process to one bus.
class BusNames : public testing::Test {
protected:
    PrivateBus daemon;
    TemporaryFolder folder;
    std::unique_ptr<Bus> first = connectSilently(Folder(folder.path()));
    std::unique_ptr<Bus> second = connectSilently(Folder(folder.path()));
};

TEST_F(BusNames, BelongToTheFirstWhoAsks) {
    EXPECT_EQ(BusName::owner(*first, "com.example.app"), std::nullopt);
    EXPECT_EQ(BusName::processOf(*first, "com.example.app"), std::nullopt);
    EXPECT_EQ(BusName::own(*first, "com.example.app", false), BusName::Result::Owner);
    EXPECT_EQ(BusName::own(*first, "com.example.app", false), BusName::Result::Owner);
    EXPECT_EQ(BusName::own(*second, "com.example.app", false), BusName::Result::Taken);
    EXPECT_EQ(BusName::owner(*second, "com.example.app"), eldbus_connection_unique_name_get(first->connection()));
    EXPECT_EQ(BusName::processOf(*second, "com.example.app"), getpid());
}

TEST_F(BusNames, PassToWhoeverIsNextInLineWhenTheirOwnerEnds) {
    EXPECT_EQ(BusName::own(*first, "com.example.app", true), BusName::Result::Owner);
    EXPECT_EQ(BusName::own(*second, "com.example.app", true), BusName::Result::Queued);
    const std::string next = eldbus_connection_unique_name_get(second->connection());
    first.reset();
    EXPECT_TRUE(runLoopUntil([&] { return BusName::owner(*second, "com.example.app") == next; }));
}

TEST_F(BusNames, AreFreeAfterTheirRelease) {
    BusName::own(*first, "com.example.app", false);
    BusName::release(*first, "com.example.app");
    EXPECT_EQ(BusName::own(*second, "com.example.app", false), BusName::Result::Owner);
}

TEST_F(BusNames, AreListedInAlphabeticalOrder) {
    BusName::own(*first, "com.example.b", false);
    BusName::own(*second, "com.example.a", false);
    EXPECT_THAT(BusName::all(*first), testing::ElementsAre("com.example.a", "com.example.b", "org.freedesktop.DBus"));
}

TEST_F(BusNames, ThatAreNoneAreRefused) {
    for (const char* name : {"", "single", ":1.5", "com..app", "com.7up", "com.exa mple", "com.ex\xc3\xa4mple", "../x"})
        EXPECT_EQ(messageOf([&] { BusName::own(*first, name, false); }),
                  "\"" + std::string(name) +
                      "\" is no name of an application; it needs two or more words of letters, digits, '-' and '_', "
                      "joined by dots");
    EXPECT_FALSE(BusName::isValid("com." + std::string(300, 'x')));
    EXPECT_TRUE(BusName::isValid("com.example.my-app_2"));
}

/// The bus of the process that answers.
Bus* serving = nullptr;

/// What the object of the other process answers.
const Eldbus_Method methods[] = {
    {"Echo", ELDBUS_ARGS({"s", "text"}), ELDBUS_ARGS({"s", "text"}),
     [](const Eldbus_Service_Interface*, const Eldbus_Message* call) {
         const char* text = nullptr;
         if (!eldbus_message_arguments_get(call, "s", &text))
             return eldbus_message_error_new(call, "com.example.Error", "no text");
         Eldbus_Message* answer = eldbus_message_method_return_new(call);
         eldbus_message_arguments_append(answer, "s", text);
         serving->flushSoon();
         return answer;
     },
     0},
    {"Describe", ELDBUS_ARGS({"i", "number"}, {"d", "real"}, {"b", "truth"}), ELDBUS_ARGS({"s", "text"}),
     [](const Eldbus_Service_Interface*, const Eldbus_Message* call) {
         int number = 0;
         double real = 0;
         Eina_Bool truth = EINA_FALSE;
         if (!eldbus_message_arguments_get(call, "idb", &number, &real, &truth))
             return eldbus_message_error_new(call, "com.example.Error", "wrong arguments");
         Eldbus_Message* answer = eldbus_message_method_return_new(call);
         const std::string text =
             std::to_string(number) + " " + std::to_string(real) + " " + (truth ? "true" : "false");
         eldbus_message_arguments_append(answer, "s", text.c_str());
         return answer;
     },
     0},
    {"IsOdd", ELDBUS_ARGS({"i", "number"}), ELDBUS_ARGS({"b", "odd"}),
     [](const Eldbus_Service_Interface*, const Eldbus_Message* call) {
         int number = 0;
         if (!eldbus_message_arguments_get(call, "i", &number))
             return eldbus_message_error_new(call, "com.example.Error", "no number");
         Eldbus_Message* answer = eldbus_message_method_return_new(call);
         eldbus_message_arguments_append(answer, "b", number % 2 != 0);
         return answer;
     },
     0},
    {"Fail", nullptr, nullptr,
     [](const Eldbus_Service_Interface*, const Eldbus_Message* call) {
         return eldbus_message_error_new(call, "com.ravella.device.Error.Failed", "there is no row \"Tea\"");
     },
     0},
    {"Hang", nullptr, nullptr,
     [](const Eldbus_Service_Interface*, const Eldbus_Message*) { return static_cast<Eldbus_Message*>(nullptr); }, 0},
    {"Die", nullptr, nullptr,
     [](const Eldbus_Service_Interface*, const Eldbus_Message*) -> Eldbus_Message* { _exit(0); }, 0},
    {nullptr, nullptr, nullptr, nullptr, 0}};

Eina_Bool folderProperty(const Eldbus_Service_Interface*, const char*, Eldbus_Message_Iter* iter, const Eldbus_Message*,
                         Eldbus_Message**) {
    return eldbus_message_iter_basic_append(iter, 's', "/some/folder");
}

const Eldbus_Property properties[] = {{"Folder", "s", folderProperty, nullptr, 0},
                                      {nullptr, nullptr, nullptr, nullptr, 0}};
const Eldbus_Service_Interface_Desc description = {
    "com.example.Interface", methods, nullptr, properties, nullptr, nullptr};

/// Another process that owns "com.example.app" and answers calls.
class BusCalls : public testing::Test {
protected:
    void SetUp() override {
        ASSERT_NE(bus, nullptr);
        while (!BusName::owner(*bus, "com.example.app"))
            poll(nullptr, 0, 1);
    }
    static int serve(const Folder& folder) {
        const auto bus = Bus::connect(folder);
        serving = bus.get();
        eldbus_service_interface_register(bus->connection(), "/com/example/app", &description);
        BusName::own(*bus, "com.example.app", false);
        ecore_main_loop_begin();
        return 0;
    }
    BusCall object(std::chrono::milliseconds timeout = std::chrono::seconds(10)) const {
        return {*bus, "com.example.app", device::bus::pathOf("com.example.app"), "com.example.Interface", timeout};
    }

    PrivateBus daemon;
    TemporaryFolder folder;
    Process server = support::processOnTheBus([this] { return serve(Folder(folder.path())); });
    std::unique_ptr<Bus> bus = connectSilently(Folder(folder.path()));
};

TEST_F(BusCalls, BringBackTextsOfAnyLength) {
    for (const std::string& text :
         {std::string("plain"), std::string(), std::string("한국어 \"quoted\"\n"), std::string(1048576, 'x')})
        EXPECT_EQ(object().text("Echo", {text}), text);
}

TEST_F(BusCalls, CarryNumbersAndTruths) {
    EXPECT_EQ(object().text("Describe", {-7, 0.25, true}), "-7 0.250000 true");
    EXPECT_TRUE(object().truth("IsOdd", {3}));
    EXPECT_FALSE(object().truth("IsOdd", {4}));
}

TEST_F(BusCalls, ReadProperties) {
    EXPECT_EQ(object().property("Folder"), "/some/folder");
}

TEST_F(BusCalls, FailWithTheMessageOfTheErrorThatCameBack) {
    EXPECT_EQ(messageOf([&] { object().call("Fail"); }), "there is no row \"Tea\"");
}

TEST_F(BusCalls, SayThatNobodyIsThere) {
    const BusCall nobody(*bus, "com.example.other", "/com/example/other", "com.example.Interface");
    EXPECT_EQ(messageOf([&] { nobody.call("Fail"); }), "com.example.other is not running");
}

TEST_F(BusCalls, SayThatNoAnswerCameInTime) {
    EXPECT_EQ(messageOf([&] { object(std::chrono::milliseconds(50)).call("Hang"); }),
              "com.example.app did not answer within 0.05 s");
}

TEST_F(BusCalls, SayThatTheOtherSideEnded) {
    EXPECT_EQ(messageOf([&] { object().call("Die"); }), "com.example.app ended before it answered");
}

TEST_F(BusCalls, SayThatTheAnswerIsNotWhatWasAskedFor) {
    EXPECT_EQ(messageOf([&] { object().truth("Echo", {std::string("text")}); }),
              "com.example.app answered with something else than was asked for; both must be of one version");
}

TEST_F(BusCalls, RefuseWhatTheBusCannotCarry) {
    using namespace std::string_literals;
    EXPECT_EQ(messageOf([&] { object().text("Echo", {"\xff"s}); }), "a text is not UTF-8; give one that is");
    EXPECT_EQ(messageOf([&] { object().text("Echo", {"a\0b"s}); }), "a text is not UTF-8; give one that is");
    EXPECT_EQ(messageOf([&] { object().call("no method"); }),
              "com.example.app: cannot be asked for \"com.example.Interface.no method\" at \"/com/example/app\"");
    EXPECT_EQ(messageOf([&] { BusCall(*bus, "no name", "/", "com.example.Interface").call("Fail"); }),
              "\"no name\" is no name of an application");
}

}  // namespace
