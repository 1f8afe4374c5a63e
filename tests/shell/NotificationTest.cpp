#include "RequestTest.h"

#include <device/Faults.h>
#include <notification.h>

#include <algorithm>

using testing::Contains;
using testing::ElementsAre;
using testing::IsEmpty;
using testing::IsSupersetOf;
using testing::SizeIs;

/// The notification that invites into the application, which a launch request asks for.
class NotificationTest : public RequestTest {
protected:
    const std::vector<std::string> asked_ = {"LaunchingType=addNoti"};

    std::vector<device::Notification> posted() const { return device()->notifications().all(); }
    std::string icon() const { return (device().appRoot() / "res/images/noti_kest.png").string(); }
    static kest_log::Line info(const std::string& function, const std::string& message) {
        return kest_log::info(file, function, message);
    }
    static kest_log::Line error(const std::string& function, const std::string& message) {
        return kest_log::error(file, function, message);
    }
    void drawIcon() const {
        std::filesystem::create_directories(device().appRoot() / "res/images");
        support::writeFile(icon(), "a picture");
    }
    /// Asks for it while this service fails.
    void askWhile(const std::string& service, int code) {
        drawIcon();
        device::faults::plan(service, code);
        start(asked_);
        EXPECT_TRUE(test_ui::hasEnded());
    }
};

// The request that was received is made first and goes last.
TEST_F(NotificationTest, IsMadeUpStepByStep) {
    drawIcon();
    start(asked_);
    EXPECT_THAT(calls::madeOf({"notification_", "app_control_create", "app_control_set", "app_control_destroy",
                               "app_resource_manager_get 0 images"}),
                ElementsAre("app_control_create", "app_control_set_app_id com.ravella.kest", "notification_create 0",
                            "notification_set_layout 1",
                            "notification_set_text 0 Kests IDS_KESTS_BODY_KESTS_M_APPLICATION_NAME -1",
                            "notification_set_text 1 Discover useful features here. "
                            "IDS_KESTS_SBODY_DISCOVER_USEFUL_FEATURES_HERE_ABB -1",
                            "app_resource_manager_get 0 images/noti_kest.png", "notification_set_image 1 " + icon(),
                            "notification_set_image 0 "
                            "/usr/apps/com.ravella.quickpanel/shared/res/noti_icons/Kest/noti_kest.png",
                            "app_control_create", "app_control_set_app_id com.ravella.kest",
                            "notification_set_launch_option 1 request", "app_control_destroy",
                            "notification_set_display_applist 11", "notification_post", "notification_free",
                            "app_control_destroy"));
}

TEST_F(NotificationTest, IsKeptOnTheDevice) {
    drawIcon();
    start(asked_);
    ASSERT_EQ(posted().size(), 1U);
    const device::Notification notification = posted().front();
    EXPECT_EQ(notification.appId, kest);
    EXPECT_EQ(notification.title.plain, "Kests");
    EXPECT_EQ(notification.title.id, "IDS_KESTS_BODY_KESTS_M_APPLICATION_NAME");
    EXPECT_EQ(notification.content.plain, "Discover useful features here.");
    EXPECT_EQ(notification.content.id, "IDS_KESTS_SBODY_DISCOVER_USEFUL_FEATURES_HERE_ABB");
    EXPECT_EQ(notification.launchAppId, kest);
    EXPECT_THAT(notification.launchExtras, IsEmpty());
}

TEST_F(NotificationTest, EndsTheApplication) {
    writeCatalogue();
    drawIcon();
    start(asked_);
    EXPECT_TRUE(test_ui::hasEnded());
    EXPECT_THAT(views(), ElementsAre("KestMainView")) << "the rest of the request is carried out";
    const std::vector<kest_log::Line> told = {begin(), RequestTest::info("Appcontrol case from addNoti"),
                                              info("__addKestNotification", "Inside add_notification"),
                                              info("__setNotificationLaunch", "app_control_create success"),
                                              missing("appID")};
    std::vector<kest_log::Line> lines = newLines();
    std::erase_if(lines, [&](const kest_log::Line& line) { return !std::ranges::count(told, line); });
    EXPECT_EQ(lines, told);
    EXPECT_THAT(kest_log::ofLevel('E', newLog()), IsEmpty());
}

TEST_F(NotificationTest, EndsARunningApplicationToo) {
    writeCatalogue();
    start();
    request({{"LaunchingType", "addNoti"}});
    EXPECT_TRUE(test_ui::hasEnded());
    EXPECT_EQ(posted().size(), 1U);
}

TEST_F(NotificationTest, OpensTheTipThatIsAskedForTogetherWithIt) {
    writeCatalogue();
    start({"LaunchingType=addNoti", std::string("appID=") + clockId});
    EXPECT_TRUE(test_ui::hasEnded());
    EXPECT_EQ(posted().size(), 1U);
    EXPECT_THAT(usage(), ElementsAre("KT03 Clock"));
    EXPECT_THAT(views(), Contains("KestContentView"));
}

TEST_F(NotificationTest, IsMadeBeforeTheTipIsLookedFor) {
    writeCatalogue();
    start({"LaunchingType=addNoti", std::string("appID=") + clockId});
    const std::vector<kest_log::Line> lines = newLines();
    const auto made = std::ranges::find(lines, info("__setNotificationLaunch", "app_control_create success"));
    const auto lookedFor = std::ranges::find(lines, RequestTest::info(std::string("Appcontrol case from ") + clockId));
    ASSERT_NE(lookedFor, lines.end());
    EXPECT_LT(made, lookedFor);
}

TEST_F(NotificationTest, IsMadeToItsEndWhateverElseIsRefused) {
    drawIcon();
    for (const char* service : {"notification_set_layout", "notification_set_text", "notification_set_display_applist"})
        device::faults::plan(service, NOTIFICATION_ERROR_OUT_OF_MEMORY, 2);
    // The first one is that of the request that was received.
    device::faults::plan("app_control_set_app_id", APP_CONTROL_ERROR_OUT_OF_MEMORY, 1, 1);
    start(asked_);
    const std::vector<std::string> made = calls::madeOf(
        {"notification_set_layout", "notification_set_text", "notification_set_image", "notification_set_launch",
         "notification_set_display", "notification_post", "notification_free"});
    EXPECT_THAT(made, SizeIs(9));
    EXPECT_EQ(made.back(), "notification_free");
}

TEST_F(NotificationTest, IsNotPostedForAnotherWord) {
    writeCatalogue();
    start({"LaunchingType=addNoti2"});
    EXPECT_FALSE(test_ui::hasEnded());
    EXPECT_THAT(posted(), IsEmpty());
    EXPECT_THAT(views(), ElementsAre("KestMainView"));
}

TEST_F(NotificationTest, IsNotPostedForAnEmptyWord) {
    writeCatalogue();
    start({"LaunchingType="});
    EXPECT_FALSE(test_ui::hasEnded());
    EXPECT_THAT(posted(), IsEmpty());
    EXPECT_THAT(newLines(), testing::Not(Contains(missing("addNoti"))));
}

TEST_F(NotificationTest, IsGivenUpWhereItCannotBeMade) {
    askWhile("notification_create", NOTIFICATION_ERROR_OUT_OF_MEMORY);
    EXPECT_THAT(newLines(), Contains(error("__addKestNotification", "Fail to notification_create")));
    EXPECT_THAT(calls::madeOf({"notification_"}), ElementsAre("notification_create 0"));
    EXPECT_THAT(posted(), IsEmpty());
}

TEST_F(NotificationTest, GoesOutWithoutAnIconForTheIndicator) {
    start(asked_);
    EXPECT_THAT(newLines(),
                Contains(error("__setNotificationImages", "Fail to notification_set_image(indicator) : " +
                                                              std::to_string(NOTIFICATION_ERROR_INVALID_PARAMETER))));
    ASSERT_EQ(posted().size(), 1U);
    EXPECT_EQ(posted().front().indicatorIcon, "");
}

TEST_F(NotificationTest, GoesOutWhereThePicturesAreRefused) {
    drawIcon();
    device::faults::plan("notification_set_image", NOTIFICATION_ERROR_OUT_OF_MEMORY, 2);
    start(asked_);
    const std::string code = std::to_string(NOTIFICATION_ERROR_OUT_OF_MEMORY);
    EXPECT_THAT(
        newLines(),
        IsSupersetOf({error("__setNotificationImages", "Fail to notification_set_image(indicator) : " + code),
                      error("__setNotificationImages", "Fail to notification_set_image(quickpanel) : " + code)}));
    EXPECT_EQ(posted().size(), 1U);
}

TEST_F(NotificationTest, GoesOutWithoutARequestWhereThatCannotBeMade) {
    drawIcon();
    // The first one stands for the request that was received.
    device::faults::plan("app_control_create", APP_CONTROL_ERROR_OUT_OF_MEMORY, 1, 1);
    start(asked_);
    EXPECT_THAT(newLines(), Contains(error("__setNotificationLaunch", "app_control_create error")));
    EXPECT_THAT(calls::madeOf({"notification_set_launch_option"}), IsEmpty());
    EXPECT_THAT(calls::madeOf({"app_control_destroy"}), SizeIs(1)) << "the one that was received";
    ASSERT_EQ(posted().size(), 1U);
    EXPECT_EQ(posted().front().launchAppId, "");
}

TEST_F(NotificationTest, GoesOutWithoutARequestWhereThatIsRefused) {
    askWhile("notification_set_launch_option", NOTIFICATION_ERROR_OUT_OF_MEMORY);
    EXPECT_THAT(newLines(), Contains(error("__setNotificationLaunch", "Fail to notification_set_text")));
    EXPECT_THAT(calls::madeOf({"app_control_destroy"}), SizeIs(2));
    EXPECT_EQ(posted().size(), 1U);
}

TEST_F(NotificationTest, MayBeRefusedByTheDevice) {
    askWhile("notification_post", NOTIFICATION_ERROR_IO_ERROR);
    EXPECT_THAT(newLines(),
                Contains(error("__addKestNotification",
                               "Fail to notification_insert (" + std::to_string(NOTIFICATION_ERROR_IO_ERROR) + ")")));
    EXPECT_THAT(calls::madeOf({"notification_free"}), ElementsAre("notification_free"));
    EXPECT_THAT(posted(), IsEmpty());
}
