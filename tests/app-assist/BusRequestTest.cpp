#include "TellingApp.h"

#include "support/BusClient.h"
#include "support/PrivateBus.h"
#include "support/TemporaryDevice.h"
#include "ui/RunningApp.h"
#include "ui/UiTest.h"

#include <device/Bus.h>
#include <gmock/gmock.h>

#include <poll.h>
#include <utility>

using support::BusClient;
using test_ui::RunningApp;
using testing::Contains;
using testing::ElementsAre;

namespace {

/// Launch requests over the bus, on the test's clock.
class BusRequest : public test_ui::UiTest {
protected:
    /// Comes back when the application's side of the bus has it.
    void send(const std::string& page) {
        client_.send({device_.appId(), device::bus::pathOf(device_.appId()), device::bus::applicationInterface},
                     "Launch", {BusClient::texts({{"page", page}})});
        client_.call({"org.freedesktop.DBus", "/org/freedesktop/DBus", "org.freedesktop.DBus"}, "GetId");
        poll(nullptr, 0, 50);
    }

    support::PrivateBus daemon_;
    support::TemporaryDevice device_;
    TellingApp app_;
    BusClient client_{daemon_.address()};
};

TEST_F(BusRequest, DoesNotOvertakeTheOneThatTheApplicationWasStartedWith) {
    RunningApp running(app_, {"page=1"});
    send("2");
    send("3");
    app_.story.clear();
    test_ui::runFor(1.0);
    EXPECT_THAT(app_.story,
                ElementsAre("onAppControl com.example.app first page=1", "onResume",
                            "onAppControl com.example.app again page=2", "onAppControl com.example.app again page=3"));
}

TEST_F(BusRequest, IsTheFirstOneWhereTheBusHasStartedTheApplication) {
    RunningApp running(app_, {"--dbus-activated"});
    test_ui::runFor(9.5);
    EXPECT_THAT(std::exchange(app_.story, {}), ElementsAre("onStart 2 --dbus-activated", "onCreate"));
    send("2");
    send("3");
    test_ui::runFor(20.0);
    EXPECT_THAT(app_.story, ElementsAre("onAppControl com.example.app first page=2", "onResume",
                                        "onAppControl com.example.app again page=3"));
    EXPECT_FALSE(test_ui::hasEnded());
}

TEST_F(BusRequest, IsWaitedForTenSecondsByAnApplicationThatTheBusHasStarted) {
    RunningApp running(app_, {"--dbus-activated"});
    test_ui::runFor(9.5);
    EXPECT_FALSE(test_ui::hasEnded());
    test_ui::runFor(1.0);
    EXPECT_TRUE(test_ui::hasEnded());
    EXPECT_THAT(app_.story, ElementsAre("onStart 2 --dbus-activated", "onCreate"));
    EXPECT_THAT(device_.logMessages(),
                Contains(testing::HasSubstr("no launch request has come within 10 s of the start "
                                            "by the bus; the end")));
}

TEST_F(BusRequest, IsNotCarriedOutWhereTheBusGoesBeforeItsTurn) {
    RunningApp running(app_, {"page=1"});
    test_ui::runFor(1.0);
    app_.story.clear();
    send("2");
    send("3");
    daemon_.kill();
    test_ui::runFor(1.0);
    EXPECT_THAT(app_.story, testing::IsEmpty());
    EXPECT_FALSE(test_ui::hasEnded());
    EXPECT_THAT(device_.logMessages(), Contains(testing::HasSubstr("the bus is gone: remote control is off")));
}

}  // namespace
