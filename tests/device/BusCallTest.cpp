#include "device/BusCall.h"

#include "SilentConnection.h"
#include "device/BusName.h"
#include "support/Message.h"
#include "support/PrivateBus.h"

#include <gmock/gmock.h>
#include <gtest/gtest.h>

namespace {

using device::Bus;
using device::BusCall;
using device::BusName;
using device::Folder;
using support::messageOf;
using support::PrivateBus;
using support::Process;
using support::TemporaryFolder;

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
