#include "ToolTest.h"

using testing::IsEmpty;
using testing::MatchesRegex;

namespace {

const std::string moment = "[0-9-]+T[0-9:]+\\.[0-9][0-9][0-9]Z";

/// Which the sample application has posted.
class Notifications : public SampleToolTest {
protected:
    static device::Notification tea() {
        device::Notification notification;
        notification.appId = sample;
        notification.title = {"Tea", "IDS_TEA"};
        notification.content = {"It is ready.", "IDS_READY"};
        notification.launchAppId = sample;
        notification.launchExtras = {{"page", "walk"}, {"cup", "2"}};
        return notification;
    }
    /// Of which a click opens nothing.
    static device::Notification bare() {
        device::Notification notification;
        notification.appId = "com.example.gone";
        return notification;
    }
    void post(const device::Notification& notification = tea()) const {
        device_.open().notifications().append(notification);
    }
    std::size_t count() { return device_.json({"notifications"}).size(); }
};

}  // namespace

TEST_F(Notifications, AreNoneAtFirst) {
    EXPECT_EQ(run({"notifications"}), done());
    EXPECT_EQ(run({"notifications", "--json"}), done("[]\n"));
    EXPECT_EQ(run({"notifications", "clear"}), done());
}

TEST_F(Notifications, AreListedTheNewestLast) {
    post();
    post(bare());
    EXPECT_THAT(device_.must({"notifications"}),
                MatchesRegex("1  " + moment + "  com.example.sample  com.example.sample page=walk cup=2  Tea  " +
                             "It is ready\\.\n" +  //
                             "2  " + moment + "  com.example.gone    -                                   -    \n"));
}

TEST_F(Notifications, AreGivenAsJson) {
    post();
    post(bare());
    nlohmann::json all = device_.json({"notifications"});
    for (nlohmann::json& notification : all) {
        EXPECT_THAT(notification["time"].get<std::string>(), MatchesRegex(moment));
        notification.erase("time");
    }
    EXPECT_EQ(all, nlohmann::json::array(
                       {{{"id", 1},
                         {"application", sample},
                         {"launch", {{"application", sample}, {"extras", {{"page", "walk"}, {"cup", "2"}}}}},
                         {"title", "Tea"},
                         {"text", "It is ready."},
                         {"icon", ""}},
                        {{"id", 2},
                         {"application", "com.example.gone"},
                         {"launch", nullptr},
                         {"title", ""},
                         {"text", ""},
                         {"icon", ""}}}));
}

TEST_F(Notifications, KeepToTheirLineWhateverTheyHold) {
    const std::string strange = "a\nb\x1b[31m";
    device::Notification notification;
    notification.appId = strange;
    notification.title.plain = strange;
    notification.content.plain = "caf\xe9";
    notification.launchAppId = strange;
    notification.launchExtras = {{strange, strange}};
    post(notification);
    EXPECT_THAT(device_.must({"notifications"}),
                testing::EndsWith("  a\\nb\\x1b[31m  a\\nb\\x1b[31m a\\nb\\x1b[31m=a\\nb\\x1b[31m  a\\nb\\x1b[31m  "
                                  "caf\xEF\xBF\xBD\n"));
}

TEST_F(Notifications, AreOpenedInTheApplicationThatTheyStart) {
    post();
    post();
    EXPECT_THAT(device_.must({"notifications", "open", "1", "--headless"}),
                MatchesRegex("opened notification 1: com\\.example\\.sample \\(process [0-9]+\\)\n"));
    EXPECT_NE(device_.application(), 0);
    ASSERT_EQ(count(), 1U);
    EXPECT_EQ(device_.json({"notifications"})[0]["id"], 2);
    const nlohmann::json launch = device_.json({"launches"})[0];
    EXPECT_EQ(launch["caller"], "kest-device");
    EXPECT_EQ(launch["application"], sample);
    EXPECT_EQ(launch["extras"], nlohmann::json({{"page", "walk"}, {"cup", "2"}}));
    EXPECT_EQ(launch["outcome"], "started");
}

TEST_F(Notifications, AreOpenedInTheApplicationThatRuns) {
    post();
    ASSERT_EQ(start().status, 0);
    const pid_t application = device_.application();
    EXPECT_EQ(run({"notifications", "open", "1"}),
              done("opened notification 1: com.example.sample (process " + std::to_string(application) + ")\n"));
    EXPECT_EQ(device_.application(), application);
    EXPECT_EQ(count(), 0U);
    EXPECT_EQ(device_.json({"launches"})[0]["outcome"], "handed over");
}

TEST_F(Notifications, AreNotOpenedWithoutADisplay) {
    post();
    EXPECT_EQ(run({"notifications", "open", "1"}), failed("there is no display to open a window on; use --headless"));
    EXPECT_EQ(count(), 1U);
}

TEST_F(Notifications, StayWhenTheirApplicationIsNotInstalled) {
    device::Notification notification = tea();
    notification.launchAppId = "com.example.none";
    post(notification);
    const Result result = run({"notifications", "open", "1", "--headless"});
    EXPECT_EQ(result.status, 1);
    EXPECT_THAT(result.err, testing::StartsWith("kest-device: error: com.example.none is not installed; what is: "));
    EXPECT_EQ(count(), 1U);
}

TEST_F(Notifications, ThatCarryNoRequestOpenNothing) {
    post(bare());
    EXPECT_EQ(run({"notifications", "open", "1"}), failed("notification 1 opens nothing: it has no launch request"));
    EXPECT_EQ(count(), 1U);
}

TEST_F(Notifications, WhoseRequestNobodyCanPassOnStay) {
    device::Notification notification = tea();
    notification.launchExtras = {{"cup=", "2"}};
    post(notification);
    EXPECT_EQ(run({"notifications", "open", "1", "--headless"}),
              failed("notification 1 cannot be opened: the extra \"cup=\" has a \"=\" in its name"));
    EXPECT_EQ(count(), 1U);
    EXPECT_EQ(device_.application(), 0);
    EXPECT_THAT(device_.json({"launches"}), IsEmpty());
}

TEST_F(Notifications, AreOpenedByTheirNumbersOnly) {
    EXPECT_EQ(run({"notifications", "open", "3"}), failed("there is no notification 3; the device has none"));
    for (int i = 0; i < 3; ++i)
        post();
    device_.open().notifications().remove(2);
    EXPECT_EQ(run({"notifications", "open", "2"}), failed("there is no notification 2; the device has 1, 3"));
    EXPECT_EQ(run({"notifications", "open", "-1"}), failed("there is no notification -1; the device has 1, 3"));
    EXPECT_EQ(run({"notifications", "open"}), wrongUsage("number is required; see 'kest-device notifications --help'"));
    EXPECT_EQ(run({"notifications", "open", "tea"}),
              wrongUsage("Could not convert: number = tea; see 'kest-device notifications --help'"));
    EXPECT_EQ(count(), 2U);
}

TEST_F(Notifications, AreCleared) {
    post();
    post();
    EXPECT_EQ(run({"notifications", "clear"}), done());
    EXPECT_EQ(count(), 0U);
    EXPECT_THAT(device_.json({"launches"}), IsEmpty());
}

TEST_F(Notifications, GoWithTheApplicationThatPostedThem) {
    post();
    post(bare());
    EXPECT_EQ(run({"uninstall", sample}), done("uninstalled com.example.sample\n"));
    ASSERT_EQ(count(), 1U);
    EXPECT_EQ(device_.json({"notifications"})[0]["id"], 2);
}

TEST_F(Notifications, GoWithAReset) {
    post();
    device_.must({"reset"});
    EXPECT_EQ(count(), 0U);
}
