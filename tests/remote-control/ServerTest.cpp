#include "device/Bus.h"
#include "device/BusCall.h"
#include "device/BusName.h"
#include "device/Error.h"
#include "support/PrivateBus.h"
#include "support/TemporaryFolder.h"

#include <gmock/gmock.h>
#include <nlohmann/json.hpp>

#include <thread>

using namespace std::chrono_literals;

namespace {

constexpr char appId[] = "com.example.sample";

/// The sample application in a process of its own, on a bus of its own, and what another process can ask of it.
class RunningSample : public testing::Test {
protected:
    RunningSample() : device_((folder_.path() / "device").string()) {
        const support::Environment folder("KEST_DEVICE", device_.root().string());
        const support::Environment engine("ELM_ENGINE", "buffer");
        application_ = std::make_unique<support::Process>(support::Process::ofProgram({SAMPLE_PROGRAM}));
        bus_ = device::Bus::connect(device_);
        if (!bus_) {
            throw std::runtime_error("no bus");
        }
        for (int i = 0; i < 2000 && !device::BusName::owner(*bus_, appId); ++i) {
            std::this_thread::sleep_for(10ms);
        }
        screen().call("Settle");
    }

    device::BusCall call(const char* interface) const {
        return device::BusCall(*bus_, appId, device::bus::pathOf(appId), interface);
    }
    device::BusCall screen() const { return call(device::bus::screenInterface); }
    bool shows(const std::string& condition) const { return screen().truth("Has", {condition}); }

    static std::string errorOf(const std::function<void()>& work) {
        try {
            work();
        } catch (const device::Error& error) {
            return error.what();
        }
        return "no error";
    }

    support::TemporaryFolder folder_;
    support::PrivateBus daemon_;
    device::Folder device_;
    std::unique_ptr<support::Process> application_;
    std::unique_ptr<device::Bus> bus_;
};

}  // namespace

TEST_F(RunningSample, TellsWhichDeviceItBelongsTo) {
    EXPECT_EQ(call(device::bus::applicationInterface).property("Folder"), device_.root().string());
}

TEST_F(RunningSample, GivesTheTreeAsJson) {
    const auto tree = nlohmann::json::parse(screen().text("Tree"));

    EXPECT_EQ(tree["title"], "Sample");
    EXPECT_EQ(tree["width"], 720);
    EXPECT_EQ(tree["height"], 1280);
    EXPECT_FALSE(tree["elements"].empty());
}

TEST_F(RunningSample, ATapOnATextAnswersWhenTheNextPageStands) {
    screen().call("TapText", {std::string("Apple")});

    EXPECT_TRUE(shows("view=PageView"));
    EXPECT_TRUE(shows("no-text=Apple"));
}

TEST_F(RunningSample, ATapASwipeAndAKeyReachTheScreen) {
    screen().call("Swipe", {360, 1000, 360, 300, 0.2});
    EXPECT_TRUE(shows("no-text=Apple"));
    screen().call("Tap", {360, 600});
    EXPECT_TRUE(shows("view=PageView"));
    screen().call("Key", {std::string("BackSpace")});
    EXPECT_TRUE(shows("view=FruitView"));
}

TEST_F(RunningSample, SavesAScreenshot) {
    const std::string file = folder_.path() / "screen.png";

    screen().call("Screenshot", {file});

    EXPECT_EQ(support::readFile(file).substr(1, 3), "PNG");
}

TEST_F(RunningSample, AnswersAFailureWithOneLine) {
    EXPECT_EQ(errorOf([this] {
                  screen().call("Tap", {-1, 0});
              }),
              "the place -1,0 is outside the screen, which is 720x1280");
    EXPECT_EQ(errorOf([this] { screen().call("Screenshot", {std::string("screen.png")}); }),
              "cannot write the picture screen.png: its path must be absolute");
    EXPECT_EQ(errorOf([this] { screen().truth("Has", {std::string("weather=fine")}); }),
              "unknown condition \"weather=fine\"; there are text=TEXT, no-text=TEXT, view=NAME and rows=NUMBER");
}

TEST_F(RunningSample, SurvivesMalformedRequests) {
    EXPECT_NE(errorOf([this] { screen().call("Tap", {std::string("here")}); }), "no error");
    EXPECT_NE(errorOf([this] { screen().call("Swipe", {1, 2}); }), "no error");
    EXPECT_NE(errorOf([this] { screen().call("Settle", {std::string("now")}); }), "no error");
    EXPECT_NE(errorOf([this] { screen().call("Dance"); }), "no error");

    EXPECT_TRUE(shows("text=Apple"));
}

TEST_F(RunningSample, QuitIsAnsweredAndEndsTheApplicationWell) {
    call(device::bus::applicationInterface).call("Quit");

    EXPECT_EQ(application_->wait(), 0);
}
