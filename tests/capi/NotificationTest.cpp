#include "notification.h"

#include "support/TemporaryDevice.h"

#include <gmock/gmock.h>
#include <gtest/gtest.h>

namespace {

using testing::ElementsAre;
using testing::IsEmpty;
using testing::Pair;

class Notification : public testing::Test {
protected:
    Notification() {
        app_control_create(&request_);
        app_control_set_app_id(request_, "com.example.tea");
    }
    ~Notification() override {
        app_control_destroy(request_);
        notification_free(notification_);
    }
    int setText(notification_text_type_e type, const char* text, const char* key) const {
        return notification_set_text(notification_, type, text, key, NOTIFICATION_VARIABLE_TYPE_NONE);
    }
    int setLaunch() const {
        return notification_set_launch_option(notification_, NOTIFICATION_LAUNCH_OPTION_APP_CONTROL, request_);
    }
    /// Posts it and looks what the device has then.
    device::Notification posted() const {
        EXPECT_EQ(notification_post(notification_), NOTIFICATION_ERROR_NONE);
        const auto all = device_->notifications().all();
        return all.empty() ? device::Notification{} : all.back();
    }

    support::TemporaryDevice device_;
    app_control_h request_ = nullptr;
    notification_h notification_ = notification_create(NOTIFICATION_TYPE_NOTI);
};

TEST_F(Notification, IsPostedWithAllThatItWasGiven) {
    app_control_add_extra_data(request_, "page", "walk");
    EXPECT_EQ(notification_set_layout(notification_, NOTIFICATION_LY_NOTI_EVENT_SINGLE), NOTIFICATION_ERROR_NONE);
    EXPECT_EQ(setText(NOTIFICATION_TEXT_TYPE_TITLE, "Tea", "IDS_TEA"), NOTIFICATION_ERROR_NONE);
    EXPECT_EQ(setText(NOTIFICATION_TEXT_TYPE_CONTENT, "It is ready.", "IDS_READY"), NOTIFICATION_ERROR_NONE);
    EXPECT_EQ(notification_set_image(notification_, NOTIFICATION_IMAGE_TYPE_ICON, "/usr/icon.png"),
              NOTIFICATION_ERROR_NONE);
    EXPECT_EQ(notification_set_image(notification_, NOTIFICATION_IMAGE_TYPE_ICON_FOR_INDICATOR, "/usr/indicator.png"),
              NOTIFICATION_ERROR_NONE);
    EXPECT_EQ(setLaunch(), NOTIFICATION_ERROR_NONE);
    EXPECT_EQ(notification_set_display_applist(notification_, NOTIFICATION_DISPLAY_APP_NOTIFICATION_TRAY |
                                                                  NOTIFICATION_DISPLAY_APP_TICKER |
                                                                  NOTIFICATION_DISPLAY_APP_INDICATOR),
              NOTIFICATION_ERROR_NONE);

    const device::Notification kept = posted();

    EXPECT_EQ(kept.id, 1);
    EXPECT_EQ(kept.appId, "com.example.app");
    EXPECT_EQ(kept.layout, 1);
    EXPECT_EQ(kept.places, 11);
    EXPECT_EQ(kept.title.plain, "Tea");
    EXPECT_EQ(kept.title.id, "IDS_TEA");
    EXPECT_EQ(kept.content.plain, "It is ready.");
    EXPECT_EQ(kept.content.id, "IDS_READY");
    EXPECT_EQ(kept.icon, "/usr/icon.png");
    EXPECT_EQ(kept.indicatorIcon, "/usr/indicator.png");
    EXPECT_EQ(kept.launchAppId, "com.example.tea");
    EXPECT_THAT(kept.launchExtras, ElementsAre(Pair("page", "walk")));
}

TEST_F(Notification, MayHaveNothingButItsApplication) {
    const device::Notification kept = posted();
    EXPECT_EQ(kept.appId, "com.example.app");
    EXPECT_EQ(kept.title.plain, "");
    EXPECT_EQ(kept.launchAppId, "");
    EXPECT_THAT(kept.launchExtras, IsEmpty());
}

TEST_F(Notification, StaysOnTheDeviceWhenItIsFreedAndMayBePostedTwice) {
    posted();
    posted();
    EXPECT_EQ(notification_free(notification_), NOTIFICATION_ERROR_NONE);
    notification_ = nullptr;
    EXPECT_EQ(device_->notifications().all().size(), 2U);
}

TEST_F(Notification, CopiesTheLaunchRequest) {
    EXPECT_EQ(setLaunch(), NOTIFICATION_ERROR_NONE);
    app_control_set_app_id(request_, "com.example.other");
    app_control_add_extra_data(request_, "late", "extra");
    const device::Notification kept = posted();
    EXPECT_EQ(kept.launchAppId, "com.example.tea");
    EXPECT_THAT(kept.launchExtras, IsEmpty());
}

TEST_F(Notification, TakesATextBackOrWithoutAKey) {
    setText(NOTIFICATION_TEXT_TYPE_TITLE, "Tea", nullptr);
    setText(NOTIFICATION_TEXT_TYPE_CONTENT, "It is ready.", "IDS_READY");
    EXPECT_EQ(setText(NOTIFICATION_TEXT_TYPE_CONTENT, nullptr, "IDS_READY"), NOTIFICATION_ERROR_NONE);
    const device::Notification kept = posted();
    EXPECT_EQ(kept.title.plain, "Tea");
    EXPECT_EQ(kept.title.id, "");
    EXPECT_EQ(kept.content.plain, "");
    EXPECT_EQ(kept.content.id, "");
}

TEST_F(Notification, IsNoneOfTheTypeNone) {
    EXPECT_EQ(notification_create(NOTIFICATION_TYPE_NONE), nullptr);
}

TEST_F(Notification, RefusesNull) {
    const int invalid = NOTIFICATION_ERROR_INVALID_PARAMETER;
    EXPECT_EQ(notification_free(nullptr), invalid);
    EXPECT_EQ(notification_set_layout(nullptr, NOTIFICATION_LY_NOTI_EVENT_SINGLE), invalid);
    EXPECT_EQ(notification_set_text(nullptr, NOTIFICATION_TEXT_TYPE_TITLE, "a", "b", NOTIFICATION_VARIABLE_TYPE_NONE),
              invalid);
    EXPECT_EQ(notification_set_image(nullptr, NOTIFICATION_IMAGE_TYPE_ICON, "/a.png"), invalid);
    EXPECT_EQ(notification_set_image(notification_, NOTIFICATION_IMAGE_TYPE_ICON, nullptr), invalid);
    EXPECT_EQ(notification_set_launch_option(nullptr, NOTIFICATION_LAUNCH_OPTION_APP_CONTROL, request_), invalid);
    EXPECT_EQ(notification_set_launch_option(notification_, NOTIFICATION_LAUNCH_OPTION_APP_CONTROL, nullptr), invalid);
    EXPECT_EQ(notification_set_display_applist(nullptr, NOTIFICATION_DISPLAY_APP_ALL), invalid);
    EXPECT_EQ(notification_post(nullptr), invalid);
    EXPECT_THAT(device_->notifications().all(), IsEmpty());
}

TEST_F(Notification, RefusesOtherTypesAndChangesNothingThen) {
    const int invalid = NOTIFICATION_ERROR_INVALID_PARAMETER;
    EXPECT_EQ(setText(static_cast<notification_text_type_e>(7), "a", "b"), invalid);
    EXPECT_EQ(notification_set_text(notification_, NOTIFICATION_TEXT_TYPE_TITLE, "a", "b", 0), invalid)
        << "a text with values";
    EXPECT_EQ(notification_set_image(notification_, static_cast<notification_image_type_e>(7), "/a.png"), invalid);
    EXPECT_EQ(
        notification_set_launch_option(notification_, static_cast<notification_launch_option_type_e>(7), request_),
        invalid);
    app_control_set_app_id(request_, "");
    EXPECT_EQ(setLaunch(), invalid) << "a request to nobody";
    const device::Notification kept = posted();
    EXPECT_EQ(kept.title.plain, "");
    EXPECT_EQ(kept.icon + kept.indicatorIcon, "");
    EXPECT_EQ(kept.launchAppId, "");
}

TEST_F(Notification, IsNotPostedWhenTheDeviceCannotKeepIt) {
    device_->database().sql().exec("DROP TABLE notification");
    EXPECT_EQ(notification_post(notification_), NOTIFICATION_ERROR_IO_ERROR);
}

}  // namespace
