#include "DesktopNotification.h"

#include "DesktopTest.h"

#include <memory>
#include <optional>

namespace {

using namespace std::chrono_literals;
using support::FakeDaemon;
using support::runLoopUntil;
using testing::ElementsAre;
using testing::HasSubstr;
using testing::IsEmpty;

constexpr char takenForMarkup[] = "body-markup";

/// One notification of the device, and the desktop that shows it.
class DesktopNotifications : public DesktopTest {
protected:
    DesktopNotifications() { device_->events().connect(*bus_); }

    void startDaemon(const std::vector<std::string>& capabilities = {"body", "actions"}) {
        daemon_.emplace(device_->folder(), capabilities);
    }
    void show(const device::Notification& notification = sample(), std::chrono::milliseconds answerTime = 10s) {
        const long long id = post(notification);
        shown_ = std::make_unique<DesktopNotification>(
            device_.device(), *bus_, *device_->notifications().find(id), [this] { ++ends_; }, answerTime);
    }
    /// The same, until the daemon has it and its number is known.
    void showWell(const device::Notification& notification = sample()) {
        startDaemon();
        show(notification);
        ASSERT_TRUE(logs(line(1, "shown on the desktop")));
    }
    bool ends() const {
        return runLoopUntil([this] { return ends_ > 0; });
    }
    bool logs(const std::string& last) const {
        return runLoopUntil([&] {
            const std::vector<std::string> messages = device_.logMessages();
            return !messages.empty() && messages.back() == last;
        });
    }
    const FakeDaemon::Call& call(std::size_t index = 0) const { return daemon_->calls().at(index); }

    std::unique_ptr<device::Bus> bus_ = device::Bus::connect(device_->folder());
    std::optional<FakeDaemon> daemon_;
    std::unique_ptr<DesktopNotification> shown_;
    int ends_ = 0;
};

TEST_F(DesktopNotifications, AreShownAsTheyLookOnTheDevice) {
    const auto icon = device_.appRoot() / "shared/res/icon.png";
    support::writeFile(icon, "\x89PNG");
    showWell();
    ASSERT_EQ(daemon_->calls().size(), 1U);
    EXPECT_EQ(call().application, "Label of com.example.app");
    EXPECT_EQ(call().replaces, 0U);
    EXPECT_EQ(call().icon, icon.string());
    EXPECT_EQ(call().title, "Tea");
    EXPECT_EQ(call().text, "It is <b>ready</b> & hot.");
    EXPECT_THAT(call().actions, ElementsAre("default", "Tea"));
    EXPECT_EQ(call().desktopEntry, "com.example.app");
    EXPECT_EQ(call().milliseconds, -1) << "as long as the desktop shows others";
    EXPECT_EQ(ends_, 0);
    EXPECT_THAT(kept(), ElementsAre(1));
}

TEST_F(DesktopNotifications, ShowTheirTextAsItIsWhereItIsTakenForMarkup) {
    startDaemon({"body", takenForMarkup});
    show();
    ASSERT_TRUE(logs(line(1, "shown on the desktop")));
    EXPECT_EQ(call().text, "It is &lt;b&gt;ready&lt;/b&gt; &amp; hot.");
    EXPECT_EQ(call().title, "Tea");
}

TEST_F(DesktopNotifications, FollowTheLanguageWhileTheyShow) {
    showWell();
    setLanguage("ko_KR.UTF-8");
    ASSERT_TRUE(runLoopUntil([this] { return daemon_->calls().size() == 2; }));
    EXPECT_EQ(call(1).replaces, 1U);
    EXPECT_EQ(call(1).title, "차");
    EXPECT_EQ(call(1).text, "차가 <다> 되었습니다 & 기다립니다.");
    EXPECT_THAT(call(1).actions, ElementsAre("default", "차"));
    daemon_->invoke(1);
    EXPECT_TRUE(ends());
    EXPECT_THAT(kept(), IsEmpty());
}

TEST_F(DesktopNotifications, FollowTheLanguageThatChangesWhileTheyAreAskedFor) {
    startDaemon();
    daemon_->onNotify([this] {
        if (daemon_->calls().size() == 1)
            setLanguage("ko_KR.UTF-8");
    });
    show();
    ASSERT_TRUE(runLoopUntil([this] { return daemon_->calls().size() == 2; }));
    EXPECT_EQ(call(1).replaces, 1U);
    EXPECT_EQ(call(1).title, "차");
}

TEST_F(DesktopNotifications, DoNotFollowOtherSettings) {
    showWell();
    bool heard = false;
    const auto subscription = device_->events().onSetting([&](const std::string&) { heard = true; });
    device_->settings().set(device::keys::theme, "dark");
    ASSERT_TRUE(runLoopUntil([&] { return heard; }));
    daemon_->close(1, 1);
    ASSERT_TRUE(ends());
    EXPECT_EQ(daemon_->calls().size(), 1U);
}

TEST_F(DesktopNotifications, LaunchTheirApplicationWhenTheyAreClicked) {
    setProgram("echo \"$@\"\n");
    showWell();
    daemon_->invoke(1);
    EXPECT_TRUE(ends());
    EXPECT_THAT(kept(), IsEmpty());
    const auto launches = device_->launches().all();
    ASSERT_EQ(launches.size(), 1U);
    EXPECT_EQ(launches[0].request.caller, "device-notifier");
    EXPECT_EQ(launches[0].outcome, device::LaunchOutcome::Started);
    EXPECT_EQ(support::readFile(device_->folder().output(tea)), "page=walk\n");
    EXPECT_THAT(device_.logMessages(), ElementsAre(line(1, "shown on the desktop"), line(1, "clicked")));
}

TEST_F(DesktopNotifications, StayUntilItIsKnownWhatHasComeOfTheLaunch) {
    setProgram("echo no tea; exit 3\n");
    showWell();
    daemon_->invoke(1);
    EXPECT_TRUE(ends());
    const auto launches = device_->launches().all();
    ASSERT_EQ(launches.size(), 1U);
    EXPECT_EQ(launches[0].outcome, device::LaunchOutcome::Failed);
    EXPECT_EQ(launches[0].reason, "it ended with status 3; its last words: no tea");
}

TEST_F(DesktopNotifications, LaunchOnceHoweverOftenTheyAreClickedAndClosed) {
    showWell();
    daemon_->invoke(1);
    daemon_->invoke(1);
    daemon_->close(1, 2);
    EXPECT_TRUE(ends());
    EXPECT_EQ(ends_, 1);
    EXPECT_EQ(device_->launches().all().size(), 1U);
    EXPECT_THAT(device_.logMessages(), ElementsAre(line(1, "shown on the desktop"), line(1, "clicked")));
}

TEST_F(DesktopNotifications, StayOnTheDeviceWhenTheirApplicationCannotBeLaunched) {
    device::Notification notification = sample();
    notification.launchAppId = "com.example.none";
    showWell(notification);
    daemon_->invoke(1);
    EXPECT_TRUE(ends());
    EXPECT_THAT(kept(), ElementsAre(1));
    EXPECT_EQ(device_.logMessages().back(),
              line(1, "clicked, but com.example.none cannot be launched; it stays on the device", 'W'));
}

TEST_F(DesktopNotifications, CannotBeClickedWithoutALaunchRequest) {
    device::Notification notification = sample();
    notification.launchAppId = "";
    showWell(notification);
    EXPECT_THAT(call().actions, IsEmpty());
}

TEST_F(DesktopNotifications, HearOfNoOtherThanTheirOwn) {
    startDaemon();
    daemon_->countFrom(7);
    show();
    ASSERT_TRUE(logs(line(1, "shown on the desktop")));
    daemon_->invoke(1);
    daemon_->close(1, 2);
    daemon_->invoke(7, "another action");
    daemon_->close(7, 1);
    EXPECT_TRUE(ends());
    EXPECT_THAT(device_->launches().all(), IsEmpty());
    EXPECT_EQ(device_.logMessages().back(), line(1, "closed on the desktop; it stays on the device"));
}

TEST_F(DesktopNotifications, StayOnTheDeviceWhenTheyAreClosed) {
    for (const std::uint32_t reason : {1U, 2U, 3U, 4U}) {
        SCOPED_TRACE(reason);
        const long long id = post();
        ends_ = 0;
        if (!daemon_)
            startDaemon();
        daemon_->countFrom(reason);
        shown_ = std::make_unique<DesktopNotification>(device_.device(), *bus_, *device_->notifications().find(id),
                                                       [this] { ++ends_; });
        ASSERT_TRUE(logs(line(id, "shown on the desktop")));
        daemon_->close(reason, reason);
        EXPECT_TRUE(ends());
        EXPECT_EQ(device_.logMessages().back(), line(id, "closed on the desktop; it stays on the device"));
    }
    EXPECT_THAT(kept(), ElementsAre(1, 2, 3, 4));
}

TEST_F(DesktopNotifications, StayOnTheDeviceWhenTheDaemonEnds) {
    showWell();
    daemon_.reset();
    EXPECT_TRUE(ends());
    EXPECT_THAT(kept(), ElementsAre(1));
    EXPECT_EQ(device_.logMessages().back(), line(1, "the desktop's daemon has ended; it stays on the device"));
}

TEST_F(DesktopNotifications, EndWhereThereIsNoDaemon) {
    EXPECT_FALSE(DesktopNotification::hasDaemon(*bus_));
    show();
    EXPECT_TRUE(ends());
    EXPECT_THAT(kept(), ElementsAre(1));
    EXPECT_THAT(device_.logMessages(),
                ElementsAre(line(1,
                                 "not shown on the desktop: The name org.freedesktop.Notifications was not provided by "
                                 "any .service files",
                                 'W')));
    startDaemon();
    EXPECT_TRUE(DesktopNotification::hasDaemon(*bus_));
}

TEST_F(DesktopNotifications, EndWhereTheDaemonNeverAnswers) {
    startDaemon();
    for (const char* method : {"GetCapabilities", "Notify"}) {
        daemon_->ignore(method);
        ends_ = 0;
        show(sample(), 50ms);
        EXPECT_TRUE(ends());
        EXPECT_EQ(ends_, 1);
        EXPECT_THAT(device_.logMessages().back(), HasSubstr("not shown on the desktop: Did not receive a reply"));
    }
    EXPECT_EQ(device_.logMessages().size(), 2U);
    EXPECT_THAT(kept(), ElementsAre(1, 2));
}

TEST_F(DesktopNotifications, EndWhereTheDaemonGivesNoNumber) {
    startDaemon();
    daemon_->countFrom(0);
    show();
    EXPECT_TRUE(ends());
    EXPECT_THAT(device_.logMessages(),
                ElementsAre(line(1, "not shown on the desktop: its daemon gave no number", 'W')));
}

TEST_F(DesktopNotifications, EndWithTheBus) {
    showWell();
    bus_->onLost([this] { shown_->busHasGone(); });
    session_.kill();
    EXPECT_TRUE(ends());
    EXPECT_EQ(device_.logMessages().back(), line(1, "the bus has gone; it stays on the device"));
}

TEST_F(DesktopNotifications, AreTakenDown) {
    showWell();
    shown_->takeDown();
    EXPECT_TRUE(ends());
    EXPECT_EQ(ends_, 1);
    EXPECT_THAT(daemon_->closed(), ElementsAre(1U));
    EXPECT_THAT(kept(), ElementsAre(1));
    EXPECT_EQ(device_.logMessages().back(), line(1, "taken off the desktop"));
}

TEST_F(DesktopNotifications, AreTakenDownAsSoonAsTheyShow) {
    startDaemon();
    daemon_->onNotify([this] { shown_->takeDown(); });
    show();
    EXPECT_TRUE(ends());
    EXPECT_THAT(daemon_->closed(), ElementsAre(1U));
}

TEST_F(DesktopNotifications, EndAtOnceWhenTheyAreTakenDownBeforeTheyAreAskedFor) {
    startDaemon();
    show();
    shown_->takeDown();
    EXPECT_EQ(ends_, 1);
    shown_->takeDown();
    EXPECT_EQ(ends_, 1);
    shown_.reset();
    EXPECT_THAT(daemon_->calls(), IsEmpty());
    EXPECT_THAT(device_.logMessages(), IsEmpty()) << "the call that was under way is dropped in silence";
}

TEST_F(DesktopNotifications, CarryTextsOfAnyLengthAndKind) {
    device::Notification notification = sample();
    notification.title = {"caf\xe9\x01", ""};
    notification.content = {std::string(1 << 20, 'x'), ""};
    showWell(notification);
    EXPECT_EQ(call().title, "caf\xEF\xBF\xBD\x01");
    EXPECT_EQ(call().text, notification.content.plain);
}

TEST_F(DesktopNotifications, SayWhatIsWrongWithTheDeviceAndEnd) {
    startDaemon();
    show();
    device_->database().sql().exec("DROP TABLE setting");
    EXPECT_TRUE(ends());
    EXPECT_EQ(ends_, 1);
    EXPECT_THAT(device_.logMessages(), ElementsAre(testing::StartsWith("E NOTIFICATION " + device_.root().string())));
}

TEST_F(DesktopNotifications, OfWhichSeveralShowAreOpenedOneByOne) {
    showWell();
    const long long second = post();
    int otherEnds = 0;
    const DesktopNotification other(device_.device(), *bus_, *device_->notifications().find(second),
                                    [&] { ++otherEnds; });
    ASSERT_TRUE(logs(line(2, "shown on the desktop")));
    daemon_->invoke(2);
    EXPECT_TRUE(runLoopUntil([&] { return otherEnds == 1; }));
    EXPECT_EQ(ends_, 0);
    EXPECT_THAT(kept(), ElementsAre(1));
    daemon_->invoke(1);
    EXPECT_TRUE(ends());
    EXPECT_THAT(kept(), IsEmpty());
    EXPECT_EQ(device_->launches().all().size(), 2U);
}

}  // namespace
