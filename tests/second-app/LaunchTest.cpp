#include "SecondAppTest.h"

#include "support/Message.h"

#include <device/ApplicationLock.h>

namespace {

bool hasOpen(pid_t process, const std::string& file) {
    std::error_code error;
    for (const auto& entry : fs::directory_iterator("/proc/" + std::to_string(process) + "/fd", error))
        if (fs::read_symlink(entry.path(), error) == file)
            return true;
    return false;
}

TEST_F(SecondAppOnABus, IsToldWhatASecondStartAsksFor) {
    auto first = start(second, {"drink=tea"});
    const auto on = device::Bus::connect(device::Folder(folder()));
    ASSERT_TRUE(on && isUp(*on, second));
    for (const char* drink : {"drink=a glass; of \"$MILK\" & <b>ice</b>", "drink="})
        EXPECT_EQ(0, start(second, {drink, "cup=2"})->wait());
    EXPECT_TRUE(logs("asked for tea"));
    EXPECT_TRUE(logs("asked again for a glass; of \"$MILK\" & <b>ice</b>"));
    EXPECT_TRUE(logs("asked again for \n"));
    EXPECT_EQ(0, first->terminate());
    EXPECT_EQ("", first->said());
}

TEST_F(SecondAppOnABus, IsToldWhatWasAskedForWhileItWasStarting) {
    auto first = start();
    std::vector<std::unique_ptr<Running>> others;
    for (int number = 0; number < 3; ++number)
        others.push_back(start(second, {"drink=number" + std::to_string(number)}));
    for (int number = 0; number < 3; ++number)
        EXPECT_TRUE(logs("for number" + std::to_string(number))) << number;
    // Whichever of them was the first goes on.
    const auto on = device::Bus::connect(device::Folder(folder()));
    ASSERT_TRUE(on);
    device::BusCall(*on, second, bus::pathOf(second), bus::applicationInterface).call("Quit");
    EXPECT_EQ(0, first->wait());
    for (const auto& other : others)
        EXPECT_EQ(0, other->wait()) << other->said();
}

TEST_F(SecondAppOnABus, SaysThatTheFirstDoesNotAnswer) {
    auto first = start();
    const auto on = device::Bus::connect(device::Folder(folder()));
    ASSERT_TRUE(on && isUp(*on, second));
    first->signal(SIGSTOP);
    auto again = start(second, {"drink=tea"});
    EXPECT_EQ(1, again->wait());
    EXPECT_EQ("second-app: error: com.example.second is running already, but the launch request cannot be handed over: "
              "com.example.second did not answer within 5 s\n",
              again->said());
    first->signal(SIGCONT);
    EXPECT_EQ(0, first->terminate());
}

TEST_F(SecondAppOnABus, SaysThatTheBusDoesNotAnswer) {
    auto first = start();
    {
        const auto on = device::Bus::connect(device::Folder(folder()));
        ASSERT_TRUE(on && isUp(*on, second));
    }
    daemon_.stop();
    auto again = start(second, {"drink=tea"});
    EXPECT_EQ(1, again->wait());
    EXPECT_EQ("second-app: error: com.example.second is running already, but the launch request cannot be handed over: "
              "there is no bus\n",
              again->said());
    first->kill();
}

TEST_F(SecondAppOnABus, TakesThePlaceOfAFirstThatEndsMeanwhile) {
    device::Folder(folder()).create();
    const std::string lockFile = device::Folder(folder()).applicationLock(second);
    auto first = support::Process::ofWork([&] {
        const device::ApplicationLock lock(device::Folder(folder()), second);
        return pause();
    });
    ASSERT_TRUE(
        waitUntil([&] { return device::ApplicationLock::holder(device::Folder(folder()), second).has_value(); }));
    auto again = start(second, {"drink=tea"});
    ASSERT_TRUE(waitUntil([&] { return hasOpen(again->id(), lockFile); }));
    first.end(SIGKILL);
    EXPECT_TRUE(logs("asked for tea"));
    EXPECT_EQ(0, again->terminate());
    EXPECT_EQ("", again->said());
}

TEST_F(SecondAppOnABus, RefusesAMalformedLaunchRequest) {
    auto app = start();
    const auto on = device::Bus::connect(device::Folder(folder()));
    ASSERT_TRUE(on && isUp(*on, second));
    const device::BusCall application(*on, second, bus::pathOf(second), bus::applicationInterface);
    EXPECT_NE("no error", support::messageOf([&] { application.call("Launch", {std::string("drink=tea")}); }));
    EXPECT_NE("no error", support::messageOf([&] { application.call("Launch"); }));
    EXPECT_EQ("an extra of the launch request has no name; give each one", support::messageOf([&] {
                  application.call("Launch", {device::BusCall::Texts{{"", "tea"}}});
              }));
    EXPECT_EQ("a text is not UTF-8; give one that is", support::messageOf([&] {
                  application.call("Launch", {device::BusCall::Texts{{"drink", "caf\xe9"}}});
              }));
    EXPECT_EQ("the request is larger than 64 KiB", support::messageOf([&] {
                  application.call("Launch", {device::BusCall::Texts{{"drink", std::string(1 << 20, 'x')}}});
              }));
    EXPECT_EQ(0, app->terminate());
}

}  // namespace
