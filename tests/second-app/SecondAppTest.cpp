#include "SecondAppTest.h"

namespace {

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
    EXPECT_EQ(1, again->wait());
    EXPECT_EQ("second-app: error: com.example.second is running already, but the launch request cannot be handed over: "
              "there is no bus\n",
              again->said());
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
