#include "SecondAppTest.h"

#include "support/BusClient.h"

namespace {

using support::BusClient;

constexpr char desktopInterface[] = "org.freedesktop.Application";
constexpr char failed[] = "com.ravella.device.Error.Failed: ";
constexpr char wrongArguments[] = "org.freedesktop.DBus.Error.InvalidSignature: ";

/// What programs of all kinds ask an application for over the bus, while it runs.
class RequestOverTheBus : public SecondAppOnABus {
protected:
    void SetUp() override {
        app_ = start();
        const auto on = device::Bus::connect(device::Folder(folder()));
        ASSERT_TRUE(on && isUp(*on, second)) << app_->said();
        client_.emplace(daemon_.address());
    }
    void TearDown() override {
        // After whatever was asked for, it runs, has said nothing, and ends as it should.
        EXPECT_EQ(0, app_->terminate());
        EXPECT_EQ("", app_->said());
    }

    static BusClient::Target at(const std::string& interface, const std::string& id = second) {
        return {id, bus::pathOf(id), interface};
    }
    std::string launch(const std::vector<BusClient::Argument>& arguments) {
        return client_->call(at(bus::applicationInterface), "Launch", arguments);
    }
    std::string ask(const std::string& method, const std::vector<BusClient::Argument>& arguments) {
        return client_->call(at(desktopInterface), method, arguments);
    }
    std::string open(const std::vector<std::string>& uris) { return ask("Open", {BusClient::list(uris), noData}); }
    /// What the application was asked for again, in order, once it was asked for `last`.
    std::vector<std::string> askedUntil(const std::string& last) {
        EXPECT_EQ("", launch({BusClient::texts({{"drink", last}})}));
        EXPECT_TRUE(logs("asked again for " + last));
        std::vector<std::string> asked;
        std::istringstream log(support::readFile(device::Folder(folder()).log()));
        const std::string mark = "asked again for ";
        for (std::string line; std::getline(log, line);)
            if (const auto found = line.find(mark); found != std::string::npos)
                asked.push_back(line.substr(found + mark.size()));
        return asked;
    }

    const BusClient::Argument noData = BusClient::nothing("{sv}");
    std::unique_ptr<Running> app_;
    std::optional<BusClient> client_;
};

TEST_F(RequestOverTheBus, IsLaunchOpenOrActivateAndComesInOrder) {
    EXPECT_EQ("", launch({BusClient::texts({{"drink", "tea"}, {"cup", "2"}})}));
    EXPECT_EQ("", ask("Activate", {noData}));
    EXPECT_EQ("", open({"drinks:milk?cup=1", "DRINKS:co%20la", "drinks:milk"}));
    EXPECT_EQ("", launch({BusClient::texts({})}));
    EXPECT_THAT(askedUntil("water"),
                testing::ElementsAre("tea", "nothing", "milk", "co la", "milk", "nothing", "water"));
}

TEST_F(RequestOverTheBus, ForNoKnownActionIsRefusedByItsName) {
    const BusClient::Argument none = BusClient::nothing("v");
    EXPECT_EQ(failed + std::string("com.example.second has no action \"brew\""),
              ask("ActivateAction", {BusClient::text("brew"), none, noData}));
    EXPECT_EQ(failed + std::string("com.example.second has no action \"a b" + std::string(197, 'x') + "...\""),
              ask("ActivateAction", {BusClient::text("a\nb" + std::string(1 << 22, 'x')), none, noData}));
    EXPECT_THAT(askedUntil("water"), testing::ElementsAre("water"));
}

TEST_F(RequestOverTheBus, OpensAllLinksOrNone) {
    const std::string form = "; such a link is written drinks:{drink}{?cup}";
    EXPECT_EQ(failed + ("cannot open \"drinks:tea#\": it has a fragment" + form),
              open({"drinks:tea", "drinks:milk", "drinks:tea#"}));
    EXPECT_EQ(failed + ("cannot open \"http://example.com/\": it does not begin with \"drinks:\"" + form),
              open({"http://example.com/"}));
    EXPECT_EQ(failed + std::string("the argument \"uris\" is empty; give a link"), open({}));
    const std::string long_ = "drinks:" + std::string(1 << 22, 'x');
    EXPECT_EQ(failed + std::string("the argument \"uris\" is larger than 64 KiB"), open({"drinks:tea", long_}));
    EXPECT_EQ(failed + std::string("the argument \"uris\" is larger than 64 KiB"),
              open(std::vector<std::string>(100000, "drinks:tea")));
    EXPECT_THAT(askedUntil("water"), testing::ElementsAre("water"));
}

TEST_F(RequestOverTheBus, OpensNoLinkWhereTheManifestNamesNone) {
    auto other = start(third);
    const auto on = device::Bus::connect(device::Folder(folder()));
    ASSERT_TRUE(on && isUp(*on, third)) << other->said();
    EXPECT_EQ(failed + std::string("com.example.third opens no links"),
              client_->call(at(desktopInterface, third), "Open", {BusClient::list({"drinks:tea"}), noData}));
    EXPECT_EQ("", client_->call(at(desktopInterface, third), "Activate", {noData}));
    EXPECT_EQ(0, other->terminate());
}

TEST_F(RequestOverTheBus, WithOtherArgumentsIsToldWhichAndWhy) {
    EXPECT_EQ(wrongArguments + std::string("Launch: the argument \"extras\" has the type s; it must be a{ss}"),
              launch({BusClient::text("drink=tea")}));
    EXPECT_EQ(wrongArguments + std::string("Launch: the argument \"extras\", of the type a{ss}, is missing"),
              launch({}));
    EXPECT_EQ(wrongArguments +
                  std::string("Launch: the call has an argument too many, of the type s behind \"extras\""),
              launch({BusClient::texts({{"drink", "tea"}}), BusClient::text(std::string(1 << 23, 'x'))}));
    EXPECT_EQ(wrongArguments + std::string("Open: the argument \"platform_data\", of the type a{sv}, is missing"),
              ask("Open", {BusClient::list({"drinks:tea"})}));
    EXPECT_EQ(wrongArguments + std::string("Activate: the argument \"platform_data\" has the type a{ss}; it must be "
                                           "a{sv}"),
              ask("Activate", {BusClient::texts({})}));
    EXPECT_EQ(wrongArguments + std::string("ActivateAction: the argument \"action_name\" has the type i; it must be s"),
              ask("ActivateAction", {BusClient::number(1)}));
    EXPECT_EQ(wrongArguments + std::string("Quit: the call has an argument too many, of the type s; the method takes "
                                           "none"),
              client_->call(at(bus::applicationInterface), "Quit", {BusClient::text("now")}));
    EXPECT_EQ(wrongArguments + std::string("Tap: the argument \"x\" has the type s; it must be i"),
              client_->call(at(bus::screenInterface), "Tap", {BusClient::text("here")}));
    EXPECT_THAT(askedUntil("water"), testing::ElementsAre("water"));
}

TEST_F(RequestOverTheBus, WithExtrasThatCannotBeIsRefused) {
    EXPECT_EQ(failed + std::string("an extra of the launch request has no name; give each one"),
              launch({BusClient::texts({{"drink", "tea"}, {"", "x"}})}));
    EXPECT_EQ(failed + std::string("the extra \"drink\" is given twice"),
              launch({BusClient::texts({{"drink", "tea"}, {"drink", "milk"}})}));
    EXPECT_EQ(failed + std::string("the extra \"a=b\" has a \"=\" in its name"),
              launch({BusClient::texts({{"a=b", "tea"}})}));
    const std::string tooLarge = failed + std::string("the request is larger than 64 KiB");
    EXPECT_EQ(tooLarge, launch({BusClient::texts({{"drink", std::string(1 << 16, 'x')}})}));
    EXPECT_EQ(tooLarge, launch({BusClient::texts({{"drink", std::string(1 << 23, 'x')}})}));
    EXPECT_EQ(tooLarge, launch({BusClient::texts({{std::string(1 << 23, 'x'), ""}})}));
    std::vector<std::pair<std::string, std::string>> many;
    for (int i = 0; i < 200000; ++i)
        many.emplace_back(std::to_string(i), "");
    EXPECT_EQ(tooLarge, launch({BusClient::texts(many)}));
    EXPECT_THAT(askedUntil("water"), testing::ElementsAre("water"));
}

TEST_F(RequestOverTheBus, ForWhatIsNotThereIsRefused) {
    EXPECT_EQ("org.freedesktop.DBus.Error.UnknownMethod: Method \"Dance\" with signature \"\" on interface "
              "\"org.freedesktop.Application\" doesn't exist\n",
              ask("Dance", {}));
    EXPECT_EQ("org.freedesktop.DBus.Error.UnknownMethod: Method \"Launch\" with signature \"a{ss}\" on interface "
              "\"com.example.None\" doesn't exist\n",
              client_->call(at("com.example.None"), "Launch", {BusClient::texts({})}));
    EXPECT_EQ("org.freedesktop.DBus.Error.UnknownMethod: Method \"Launch\" with signature \"a{ss}\" on interface "
              "\"com.ravella.device.Application\" doesn't exist\n",
              client_->call({second, "/com/example", bus::applicationInterface}, "Launch", {BusClient::texts({})}));
    EXPECT_THAT(askedUntil("water"), testing::ElementsAre("water"));
}

TEST_F(RequestOverTheBus, TakesWhatIsOddButText) {
    const std::string odd = "\"q\" 'a' $(reboot) `x` %s%n \\ = ; \xC3\xA4 <b>&amp;";
    EXPECT_EQ("", launch({BusClient::texts({{"drink", odd}, {"x y", "z"}, {"\n", ""}})}));
    EXPECT_EQ("", launch({BusClient::texts({{"drink", ""}})}));
    EXPECT_EQ("", launch({BusClient::texts({{"drink", "a"}, {"long", std::string(60000, 'x')}})}));
    EXPECT_THAT(askedUntil("water"), testing::ElementsAre(odd, "", "a", "water"));
}

/// A start that waits for what the bus has been asked for.
using StartByTheBus = SecondAppOnABus;

TEST_F(StartByTheBus, HasTheFirstRequestFromTheBus) {
    auto app = start(second, {"--dbus-activated"});
    const auto on = device::Bus::connect(device::Folder(folder()));
    ASSERT_TRUE(on && waitUntil([&] { return device::BusName::owner(*on, second).has_value(); })) << app->said();
    BusClient client(daemon_.address());
    EXPECT_EQ("", client.call({second, bus::pathOf(second), bus::applicationInterface}, "Launch",
                              {BusClient::texts({{"drink", "tea"}})}));
    ASSERT_TRUE(isUp(*on, second));
    EXPECT_TRUE(logs("asked for tea"));
    EXPECT_EQ(0, app->terminate());
    EXPECT_EQ("", app->said());
}

TEST_F(StartByTheBus, LeavesTheRequestToTheOneThatRunsAlready) {
    auto first = start();
    const auto on = device::Bus::connect(device::Folder(folder()));
    ASSERT_TRUE(on && isUp(*on, second)) << first->said();
    auto again = start(second, {"--dbus-activated"});
    EXPECT_EQ(0, again->wait());
    EXPECT_EQ("second-app: com.example.second is running already\n", again->said());
    EXPECT_EQ(0, first->terminate());
    EXPECT_EQ(std::string::npos, support::readFile(device::Folder(folder()).log()).find("asked again"));
}

TEST_F(StartByTheBus, TakesNoExtras) {
    auto app = start(second, {"--dbus-activated", "drink=tea"});
    EXPECT_EQ(2, app->wait());
    EXPECT_EQ("second-app: error: --dbus-activated goes without extras: the launch request comes over the bus\n",
              app->said());
}

TEST_F(SecondAppAlone, StartedByABusThatItCannotReachSaysSo) {
    auto app = start(second, {"--dbus-activated"});
    EXPECT_EQ(1, app->wait());
    EXPECT_EQ("second-app: error: there is no bus, so the launch request cannot come\n", app->said());
}

}  // namespace
