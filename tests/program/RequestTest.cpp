#include "RequestTest.h"

#include <device/Notifications.h>

#include <functional>
#include <poll.h>

using test_tool::done;
using testing::AnyOf;
using testing::ElementsAre;
using testing::IsEmpty;
using testing::StartsWith;

namespace {

using Json = nlohmann::json;
using support::BusClient;

/// The first element that `is` holds for; null when there is none.
Json find(const Json& elements, const std::function<bool(const Json&)>& is) {
    for (const Json& element : elements) {
        if (is(element)) {
            return element;
        }
        if (Json below = find(element.value("children", Json::array()), is); !below.is_null()) {
            return below;
        }
    }
    return nullptr;
}

}  // namespace

std::vector<std::string> RequestTest::views() {
    const Json stack = find(device_.json({"tree"})["elements"],
                            [](const Json& element) { return element["type"] == "Elm_Naviframe"; });
    std::vector<std::string> found;
    for (const Json& item : stack.is_null() ? Json::array() : stack.value("items", Json::array())) {
        found.push_back(item.value("view", ""));
    }
    return found;
}

std::vector<std::string> RequestTest::records() {
    std::vector<std::string> found;
    for (const Json& record : device_.json({"usage"})) {
        const Json& values = record["values"];
        EXPECT_EQ(values["app_id"], app);
        found.push_back(values["feature"].get<std::string>() + " " + values.value("extra", ""));
    }
    return found;
}

int RequestTest::pageInView() {
    const Json pages = find(device_.json({"tree"})["elements"], [](const Json& element) {
        return element["visible"] == true && element.value("style", "") == "effect" && element.contains("page");
    });
    return pages.is_null() ? -1 : pages["page"].get<int>() - 1;
}

void RequestTest::expectTipAboveTheList(int menu) {
    EXPECT_THAT(views(), ElementsAre("KestMainView", "KestContentView"));
    EXPECT_EQ(pageInView(), menu);

    device_.must({"key", "back"});
    EXPECT_THAT(views(), ElementsAre("KestMainView"));
    EXPECT_THAT(records(), ElementsAre(recordInSight(menu)));

    EXPECT_EQ(device_.run({"key", "back"}), done("com.ravella.kest ended\n"));
}

namespace {

/// The first request starts the application.
class ColdRequest : public RequestTest {};

using WarmRequest = WarmRequestTest;

}  // namespace

TEST_F(ColdRequest, ForNothingShowsTheList) {
    launchCold();
    EXPECT_THAT(views(), ElementsAre("KestMainView"));
    EXPECT_THAT(records(), IsEmpty());
    EXPECT_EQ(device_.json({"launches"})[0]["outcome"], "started");
}

TEST_F(ColdRequest, ForATipShowsItWithTheListBeneath) {
    launchCold({clockTip});
    expectTipAboveTheList(clockMenu_);
}

TEST_F(ColdRequest, ForSeveralTipsShowsEachWithOneListBeneath) {
    device_.must({"set", "country", "IN"});
    launchCold({"appID=com.ravella.weather"});
    EXPECT_THAT(views(), ElementsAre("KestMainView", "KestContentView", "KestContentView"));

    device_.must({"key", "back"});
    device_.must({"key", "back"});
    EXPECT_THAT(views(), ElementsAre("KestMainView"));
    EXPECT_THAT(records(), ElementsAre(recordInSight(menuOf("contents/weather_tomorrow.xml", "India")),
                                       recordInSight(menuOf("contents/weather_air.xml", "India"))));
}

TEST_F(ColdRequest, ForALaterTipOfAnApplicationShowsThatOne) {
    device_.must({"set", "country", "IN"});
    launchCold({"appID=com.ravella.weather", "page=2"});
    expectTipAboveTheList(menuOf("contents/weather_air.xml", "India"));
}

TEST_F(ColdRequest, ForATipThatIsNotThereShowsNothingUntilALaterOneIs) {
    launchCold({clockTip, "page=99999999999999999999"});
    EXPECT_THAT(views(), IsEmpty());
    EXPECT_EQ(launch({"appID=com.example.none"}), handedOver());
    EXPECT_EQ(launch(), handedOver());
    EXPECT_THAT(views(), IsEmpty());
    EXPECT_THAT(records(), IsEmpty());

    EXPECT_EQ(launch({clockTip}), handedOver());
    EXPECT_THAT(views(), ElementsAre("KestContentView"));
    EXPECT_THAT(records(), ElementsAre(StartsWith("KT03 ")));
}

TEST_F(ColdRequest, ForTheNotificationPostsItAndEnds) {
    EXPECT_EQ(launch({postNotification}), done("com.ravella.kest was started and ended by itself\n"));
    EXPECT_EQ(device_.json({"status"})["applications"], Json::array());
    EXPECT_EQ(device_.open().notifications().all().size(), 1U);
    EXPECT_THAT(records(), IsEmpty());
}

TEST_F(ColdRequest, ForTheNotificationAndATipRecordsTheTip) {
    EXPECT_EQ(launch({postNotification, clockTip}), done("com.ravella.kest was started and ended by itself\n"));
    EXPECT_EQ(device_.open().notifications().all().size(), 1U);
    EXPECT_THAT(records(), ElementsAre(StartsWith("KT03 ")));
}

TEST_F(ColdRequest, ThatComesDuringTheStartIsTheSecondOne) {
    const auto first = device_.runInBackground({"launch", app, "--headless", settingsTip});
    // The other run keeps the device to itself meanwhile; one that is started by hand need not wait for it.
    EXPECT_EQ(launch({clockTip}).status, 0);
    EXPECT_THAT(views(), ElementsAre("KestMainView", "KestContentView"));
    device_.must({"key", "back"});
    EXPECT_THAT(records(), testing::UnorderedElementsAre(recordInSight(clockMenu_), recordInSight(settingsMenu_)));
}

TEST_F(ColdRequest, OfAnotherApplicationFollowsTheOneInFront) {
    start();
    // Without --headless, where there is no display.
    EXPECT_THAT(device_.must({"launch", clockId, "page=faces"}), StartsWith("com.ravella.clock runs, headless ("));
    EXPECT_EQ(device_.run({"wait-for", "text=page: faces", "--timeout", "0"}), done());
    EXPECT_THAT(device_.must({"launch", app, clockTip}), StartsWith("com.ravella.kest has the request ("));
    EXPECT_EQ(device_.run({"wait-for", "view=KestContentView", "--timeout", "0"}), done()) << "it is in front again";
}

TEST_F(WarmRequest, ForNothingLeavesWhatShows) {
    EXPECT_EQ(launch(), handedOver());
    EXPECT_THAT(views(), ElementsAre("KestMainView"));
    device_.must({"tap", "--text", titles_[1]});
    EXPECT_EQ(launch(), handedOver());
    EXPECT_THAT(views(), ElementsAre("KestMainView", "KestContentView"));
    EXPECT_THAT(records(), ElementsAre("KT01 " + titles_[1]));
}

TEST_F(WarmRequest, ForATipShowsIt) {
    EXPECT_EQ(launch({clockTip}), handedOver());
    EXPECT_THAT(views(), ElementsAre("KestMainView", "KestContentView"));
    EXPECT_EQ(pageInView(), clockMenu_);
    EXPECT_THAT(records(), ElementsAre(recordOf(clockMenu_)));
    device_.must({"key", "back"});
    EXPECT_THAT(views(), ElementsAre("KestMainView"));
}

TEST_F(WarmRequest, ForAnotherTipTurnsThePagerThatIsOpen) {
    EXPECT_EQ(launch({clockTip}), handedOver());
    EXPECT_EQ(launch({settingsTip}), handedOver());
    EXPECT_THAT(views(), ElementsAre("KestMainView", "KestContentView"));
    EXPECT_EQ(pageInView(), settingsMenu_);
    EXPECT_THAT(records(), ElementsAre(recordOf(clockMenu_), recordOf(settingsMenu_)));
}

TEST_F(WarmRequest, TwiceInARowIsRecordedTwiceAndShownOnce) {
    EXPECT_EQ(launch({clockTip, "page=1"}), handedOver());
    EXPECT_EQ(launch({clockTip, "page=1"}), handedOver());
    EXPECT_THAT(views(), ElementsAre("KestMainView", "KestContentView"));
    EXPECT_EQ(pageInView(), clockMenu_);
    EXPECT_THAT(records(), ElementsAre(recordOf(clockMenu_), recordOf(clockMenu_)));
}

TEST_F(WarmRequest, TwiceAtATimeShowsTheLastOne) {
    BusClient other(address());
    other.send(target(), "Launch", {BusClient::texts({{"appID", clockId}})});
    EXPECT_EQ(other.call(target(), "Launch", {BusClient::texts({{"appID", "com.ravella.settings"}})}), "");
    EXPECT_EQ(other.call(target(device::bus::screenInterface), "Settle"), "");
    EXPECT_THAT(views(), ElementsAre("KestMainView", "KestContentView"));
    EXPECT_EQ(pageInView(), settingsMenu_);
    EXPECT_THAT(records(), ElementsAre(recordOf(clockMenu_), recordOf(settingsMenu_)));
}

TEST_F(WarmRequest, WhileAPagerMovesInTurnsIt) {
    BusClient other(address());
    other.send(target(), "Launch", {BusClient::texts({{"appID", clockId}})});
    for (const char* id : {"com.ravella.settings", "com.ravella.heartrate", "com.ravella.exercise"}) {
        // A frame or two of the movement later.
        poll(nullptr, 0, 40);
        EXPECT_EQ(other.call(target(), "Launch", {BusClient::texts({{"appID", id}})}), "");
    }
    EXPECT_EQ(other.call(target(device::bus::screenInterface), "Settle"), "");
    EXPECT_THAT(views(), ElementsAre("KestMainView", "KestContentView"));
    EXPECT_EQ(pageInView(), exerciseMenu_);
    EXPECT_THAT(records(), ElementsAre(recordOf(clockMenu_), recordOf(settingsMenu_), recordOf(heartrateMenu_),
                                       recordOf(exerciseMenu_)));
}

TEST_F(WarmRequest, ForTheNotificationPostsItAndEnds) {
    EXPECT_EQ(launch({postNotification}), done("com.ravella.kest has the request and ended by itself\n"));
    EXPECT_EQ(device_.json({"status"})["applications"], Json::array());
    EXPECT_EQ(device_.open().notifications().all().size(), 1U);
    EXPECT_THAT(records(), IsEmpty());
}

TEST_F(WarmRequest, ThatComesWhileItEndsIsNotSaidToBeTaken) {
    BusClient other(address());
    other.send(target(), "Launch", {BusClient::texts({{"LaunchingType", "addNoti"}})});
    // As the application leaves the bus after the call has come, or before.
    EXPECT_THAT(
        other.call(target(), "Launch", {BusClient::texts({{"appID", clockId}})}),
        AnyOf("org.freedesktop.DBus.Error.NoReply: Message recipient disconnected from message bus without replying",
              "org.freedesktop.DBus.Error.NameHasNoOwner: Name \"com.ravella.kest\" does not exist"));
    EXPECT_THAT(records(), IsEmpty());
}
