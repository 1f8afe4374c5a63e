#include "FakeDaemon.h"
#include "ProgramTest.h"
#include "support/PrivateBus.h"

#include <chrono>
#include <sstream>

using support::FakeDaemon;
using support::runLoopUntil;
using test_tool::done;
using testing::ElementsAre;
using testing::IsEmpty;
using testing::MatchesRegex;
using testing::SizeIs;

namespace {

constexpr char title[] = "Tips";
constexpr char text[] = "Discover useful features here.";

/// What the application invites with when it is asked to.
class Invitation : public ProgramTest {
protected:
    void post() {
        EXPECT_EQ(device_.run({"launch", app, "LaunchingType=addNoti", "--headless"}),
                  done("com.ravella.kest was started and ended by itself\n"));
    }
    /// The lines about notifications, without time and process.
    std::vector<std::string> notificationLog() const {
        std::vector<std::string> lines;
        std::istringstream all(support::readFile(device_.root() / "device.log"));
        for (std::string line; std::getline(all, line);)
            if (line.find(" NOTIFICATION(") != std::string::npos)
                lines.push_back(line.substr(line.find(") ") + 2));
        return lines;
    }
    bool logs(std::size_t count) const {
        return runLoopUntil([&] { return notificationLog().size() == count; });
    }
};

/// The same on a desktop.
class InvitationOnTheDesktop : public Invitation {
protected:
    InvitationOnTheDesktop() { device_.setEnvironment("DBUS_SESSION_BUS_ADDRESS", session_.address()); }

    bool shows(std::size_t count) {
        return runLoopUntil([&] { return daemon_.calls().size() == count; });
    }
    bool nothingRuns() {
        return runLoopUntil([&] { return device_.processes().empty(); });
    }

    support::PrivateBus session_;
    FakeDaemon daemon_{device::Folder(device_.root())};
};

}  // namespace

TEST_F(Invitation, IsKeptOnTheDeviceInItsLanguage) {
    post();
    EXPECT_THAT(device_.must({"notifications"}),
                MatchesRegex("1  [0-9-]+T[0-9:.]+Z  com\\.ravella\\.kest  com\\.ravella\\.kest  Tips  Discover useful "
                             "features here\\.\n"));
    device_.must({"set", "language", "ko_KR"});
    const auto korean = device_.json({"notifications"})[0];
    EXPECT_EQ(korean["title"], "팁");
    EXPECT_EQ(korean["text"], "유용한 기능을 여기에서 만나 보세요.");
    EXPECT_EQ(korean["launch"], nlohmann::json({{"application", app}, {"extras", nlohmann::json::object()}}));
    EXPECT_THAT(korean["icon"].get<std::string>(), testing::HasSubstr("/com.ravella.kest/shared/res/"));
}

TEST_F(Invitation, LeavesNothingRunningWhereThereIsNoDesktop) {
    post();
    EXPECT_TRUE(logs(1));
    EXPECT_TRUE(runLoopUntil([&] { return device_.processes().empty(); }));
    EXPECT_THAT(notificationLog(), ElementsAre(testing::StartsWith("notification 1: not shown on the desktop: ")));
}

TEST_F(Invitation, OpensTheListWhenItIsOpened) {
    post();
    EXPECT_THAT(device_.must({"notifications", "open", "1", "--headless"}),
                MatchesRegex("opened notification 1: com\\.ravella\\.kest \\(process [0-9]+\\)\n"));
    EXPECT_EQ(titleBar(), "Tips");
    EXPECT_FALSE(rows().empty());
    EXPECT_THAT(device_.json({"notifications"}), IsEmpty());
}

TEST_F(InvitationOnTheDesktop, ShowsAndOpensTheListWhenItIsClicked) {
    post();
    ASSERT_TRUE(shows(1));
    EXPECT_EQ(daemon_.calls()[0].title, title);
    EXPECT_EQ(daemon_.calls()[0].text, text);
    EXPECT_EQ(daemon_.calls()[0].desktopEntry, app);
    EXPECT_TRUE(std::filesystem::is_regular_file(daemon_.calls()[0].icon));
    ASSERT_TRUE(logs(1));
    daemon_.invoke(1);
    ASSERT_TRUE(logs(2));
    EXPECT_EQ(notificationLog().back(), "notification 1: clicked");
    EXPECT_EQ(device_.run({"wait-for", "text=Tips", "--app", app}), done());
    EXPECT_FALSE(rows().empty());
    EXPECT_THAT(device_.json({"notifications"}), IsEmpty());
    const auto launch = device_.json({"launches"}).back();
    EXPECT_EQ(launch["caller"], "device-notifier");
    EXPECT_EQ(launch["outcome"], "started");
}

TEST_F(InvitationOnTheDesktop, FollowsTheLanguage) {
    post();
    ASSERT_TRUE(shows(1));
    ASSERT_TRUE(logs(1));
    device_.must({"set", "language", "ko_KR"});
    ASSERT_TRUE(shows(2));
    EXPECT_EQ(daemon_.calls()[1].title, "팁");
    EXPECT_EQ(daemon_.calls()[1].replaces, 1U);
}

TEST_F(InvitationOnTheDesktop, GoesFromTheDesktopWhenItIsOpenedElsewhere) {
    post();
    ASSERT_TRUE(shows(1));
    ASSERT_TRUE(logs(1));
    test_tool::BackgroundRun opening = device_.runInBackground({"notifications", "open", "1", "--headless"});
    EXPECT_TRUE(runLoopUntil([&] { return daemon_.closed() == std::vector<std::uint32_t>{1}; }));
    EXPECT_TRUE(runLoopUntil([&] { return opening.out().starts_with("opened notification 1: "); }));
}

TEST_F(InvitationOnTheDesktop, GoesWithTheDevice) {
    post();
    ASSERT_TRUE(shows(1));
    ASSERT_TRUE(logs(1));
    const test_tool::BackgroundRun stopping = device_.runInBackground({"stop"});
    EXPECT_TRUE(runLoopUntil([&] { return stopping.out().starts_with("the notifier of notification 1 (process "); }));
    EXPECT_THAT(daemon_.closed(), ElementsAre(1U));
    EXPECT_TRUE(nothingRuns());
    EXPECT_THAT(device_.json({"notifications"}), SizeIs(1));
}

TEST_F(InvitationOnTheDesktop, GoesWithAReset) {
    post();
    ASSERT_TRUE(shows(1));
    const test_tool::BackgroundRun resetting = device_.runInBackground({"reset"});
    EXPECT_TRUE(runLoopUntil([&] { return resetting.out().find(" is as new") != std::string::npos; }));
    EXPECT_TRUE(nothingRuns());
    EXPECT_THAT(device_.json({"notifications"}), IsEmpty());
}

TEST_F(InvitationOnTheDesktop, KeepsNobodyWaiting) {
    device_.must({"get"});
    daemon_.ignore("GetCapabilities");
    const auto begin = std::chrono::steady_clock::now();
    post();
    EXPECT_LT(std::chrono::steady_clock::now() - begin, std::chrono::seconds(8))
        << "the daemon, which never answers, is given ten";
    EXPECT_THAT(device_.must({"stop"}), MatchesRegex("the notifier of notification 1 \\(process [0-9]+\\) ended\n"));
    EXPECT_TRUE(nothingRuns());
}
