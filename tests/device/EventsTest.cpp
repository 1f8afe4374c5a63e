#include "device/Events.h"

#include "device/Bus.h"
#include "device/Keys.h"
#include "support/PrivateBus.h"
#include "support/TemporaryDevice.h"

#include <gmock/gmock.h>
#include <gtest/gtest.h>

namespace {

using support::PrivateBus;
using support::Process;
using support::runLoopUntil;
using support::TemporaryDevice;
using testing::ElementsAre;
using testing::IsEmpty;

using Texts = std::vector<std::string>;

device::Events::SettingHandler addTo(Texts& told, const std::string& who = "") {
    return [&told, who](const std::string& key) { told.push_back(who + key); };
}

TEST(EventsWithoutABus, TellOfASettingAtOnceAndInTheOrderOfSubscription) {
    const TemporaryDevice device;
    Texts told;
    const auto first = device->events().onSetting(addTo(told, "first "));
    const auto second = device->events().onSetting(addTo(told, "second "));
    device->settings().set("db/some/key", "value");
    EXPECT_THAT(told, ElementsAre("first db/some/key", "second db/some/key"));
}

TEST(EventsWithoutABus, TellAlsoWhenTheValueIsTheOldOneAndWhenItIsRemoved) {
    const TemporaryDevice device;
    device->settings().set("key", "value");
    Texts told;
    const auto subscription = device->events().onSetting(addTo(told));
    device->settings().set("key", "value");
    device->settings().remove("key");
    EXPECT_THAT(told, ElementsAre("key", "key"));
}

TEST(EventsWithoutABus, EndWithTheirSubscription) {
    const TemporaryDevice device;
    Texts told;
    auto subscription = device->events().onSetting(addTo(told));
    subscription.reset();
    device->settings().set("key", "value");
    EXPECT_THAT(told, IsEmpty());
}

TEST(EventsWithoutABus, MayEndFromInsideTheirHandler) {
    const TemporaryDevice device;
    Texts told;
    device::Events::Subscription first;
    device::Events::Subscription second;
    first = device->events().onSetting([&](const std::string& key) {
        told.push_back("first " + key);
        first.reset();
        second.reset();
    });
    second = device->events().onSetting(addTo(told, "second "));
    device->settings().set("key", "value");
    device->settings().set("key", "value");
    EXPECT_THAT(told, ElementsAre("first key"));
}

TEST(EventsWithoutABus, MayBeginFromInsideAHandlerAndAreToldFromTheNextOneOn) {
    const TemporaryDevice device;
    Texts told;
    device::Events::Subscription inner;
    const auto outer = device->events().onSetting([&](const std::string&) {
        if (!inner)
            inner = device->events().onSetting(addTo(told, "inner "));
    });
    device->settings().set("one", "value");
    device->settings().set("two", "value");
    EXPECT_THAT(told, ElementsAre("inner two"));
}

TEST(EventsWithoutABus, OutliveADeviceThatIsReplacedWithoutHarm) {
    TemporaryDevice device;
    Texts told;
    auto subscription = device->events().onSetting(addTo(told));
    device.reopen();
    device->settings().set("key", "value");
    subscription.reset();
    EXPECT_THAT(told, IsEmpty());
}

TEST(EventsWithoutABus, GoOnToTheNextHandlerWhenOneThrows) {
    const TemporaryDevice device;
    Texts told;
    const auto bad = device->events().onSetting([](const std::string&) { throw std::runtime_error("handler broke"); });
    const auto good = device->events().onSetting(addTo(told));
    testing::internal::CaptureStderr();
    device->settings().set("key", "value");
    EXPECT_EQ(testing::internal::GetCapturedStderr(), "handler broke\n");
    EXPECT_THAT(told, ElementsAre("key"));
}

/// A device on a bus, with the events of both kinds written down.
class EventsOverABus : public testing::Test {
protected:
    EventsOverABus() {
        device->events().connect(*bus);
        setting = device->events().onSetting(addTo(settings));
        package = device->events().onPackage([this](const device::PackageEvent& event) { packages.push_back(event); });
    }

    PrivateBus daemon;
    TemporaryDevice device;
    std::unique_ptr<device::Bus> bus = device::Bus::connect(device->folder());
    Texts settings;
    std::vector<device::PackageEvent> packages;
    device::Events::Subscription setting;
    device::Events::Subscription package;
};

TEST_F(EventsOverABus, ReachTheProcessThatSentThemFromItsMainLoop) {
    device->settings().set("key", "value");
    EXPECT_THAT(settings, IsEmpty());
    EXPECT_TRUE(runLoopUntil([&] { return !settings.empty(); }));
    EXPECT_THAT(settings, ElementsAre("key"));
}

TEST_F(EventsOverABus, CarryEverythingThatIsKnownOfAPackage) {
    device->events().publishPackage(
        {"com.example.tea", device::PackageEvent::Type::Update, device::PackageEvent::State::Failed, 50, -5});
    EXPECT_TRUE(runLoopUntil([&] { return !packages.empty(); }));
    ASSERT_EQ(packages.size(), 1U);
    EXPECT_EQ(packages[0].id, "com.example.tea");
    EXPECT_EQ(packages[0].type, device::PackageEvent::Type::Update);
    EXPECT_EQ(packages[0].state, device::PackageEvent::State::Failed);
    EXPECT_EQ(packages[0].progress, 50);
    EXPECT_EQ(packages[0].error, -5);
}

/// Opens the device in another process, joins the bus and works on it.
Process otherProcess(const device::Device::Options& options, const std::function<void(device::Device&)>& work) {
    return support::processOnTheBus([=] {
        device::Device device(options);
        const auto bus = device::Bus::connect(device.folder());
        device.events().connect(*bus);
        work(device);
        return 0;
    });
}

TEST(EventsBetweenProcesses, ReachEveryProcessOfTheDeviceInTheirOrder) {
    const PrivateBus daemon;
    const TemporaryDevice device;
    const auto bus = device::Bus::connect(device->folder());
    device->events().connect(*bus);
    Texts told;
    const auto subscription = device->events().onSetting(addTo(told));
    auto other = otherProcess(device.options(), [](device::Device& same) {
        for (const char* key : {"one", "two", "three"})
            same.settings().set(key, "value");
    });
    EXPECT_TRUE(runLoopUntil([&] { return told.size() == 3; }));
    EXPECT_EQ(other.wait(), 0);
    EXPECT_THAT(told, ElementsAre("one", "two", "three"));
    EXPECT_EQ(device->settings().get("three"), "value");
}

TEST(EventsBetweenProcesses, OfAnotherDeviceOnTheSameBusAreNotHeard) {
    const PrivateBus daemon;
    const TemporaryDevice device;
    const auto bus = device::Bus::connect(device->folder());
    device->events().connect(*bus);
    Texts told;
    const auto subscription = device->events().onSetting(addTo(told));

    const support::TemporaryFolder elsewhere;
    device::Device::Options options = device.options();
    options.folder = device::Folder(elsewhere.path() / "device");
    EXPECT_EQ(otherProcess(options, [](device::Device& other) { other.settings().set("other", "value"); }).wait(), 0);
    device->settings().set("own", "value");
    EXPECT_TRUE(runLoopUntil([&] { return !told.empty(); }));
    EXPECT_THAT(told, ElementsAre("own"));
}

TEST_F(EventsOverABus, WhoseNameCannotTravelReachThisProcessAtOnce) {
    device->settings().set("\xff", "value");
    EXPECT_THAT(settings, ElementsAre("\xff"));
}

TEST_F(EventsOverABus, AreLocalAgainAfterTheDisconnection) {
    device->events().disconnect();
    device->settings().set("key", "value");
    EXPECT_THAT(settings, ElementsAre("key"));
}

TEST_F(EventsOverABus, AreLocalAgainWhenTheBusIsDestroyed) {
    bus.reset();
    device->settings().set("key", "value");
    EXPECT_THAT(settings, ElementsAre("key"));
}

TEST_F(EventsOverABus, AreLocalAgainWhenTheBusIsLost) {
    bool lost = false;
    bus->onLost([&] { lost = true; });
    daemon.kill();
    EXPECT_TRUE(runLoopUntil([&] { return lost; }));
    device->settings().set("key", "value");
    EXPECT_THAT(settings, ElementsAre("key"));
}

TEST_F(EventsOverABus, MayFindTheDeviceGoneBeforeTheBus) {
    device::Device::setCurrent(nullptr);
    EXPECT_TRUE(bus->isAlive());
    bus.reset();
}

TEST_F(EventsOverABus, WithOtherArgumentsThanTheirsAreIgnored) {
    Eldbus_Message* signal =
        eldbus_message_signal_new(device::bus::eventsPath, device::bus::eventsInterface, "SettingChanged");
    eldbus_message_arguments_append(signal, "u", 7U);
    eldbus_connection_send(bus->connection(), signal, nullptr, nullptr, -1);
    signal = eldbus_message_signal_new(device::bus::eventsPath, device::bus::eventsInterface, "PackageChanged");
    eldbus_message_arguments_append(signal, "ssuuii", device.root().c_str(), "com.example.tea", 99U, 0U, 0, 0);
    eldbus_connection_send(bus->connection(), signal, nullptr, nullptr, -1);
    device->settings().set("after", "value");
    testing::internal::CaptureStderr();
    EXPECT_TRUE(runLoopUntil([&] { return !settings.empty(); }));
    EXPECT_EQ(testing::internal::GetCapturedStderr(), "");
    EXPECT_THAT(settings, ElementsAre("after"));
    EXPECT_THAT(packages, IsEmpty());
}

}  // namespace
