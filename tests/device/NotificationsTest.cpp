#include "support/Message.h"
#include "support/TemporaryDevice.h"

#include <gmock/gmock.h>
#include <gtest/gtest.h>

namespace {

using device::Notification;
using testing::ElementsAre;
using testing::HasSubstr;
using testing::IsEmpty;
using testing::MatchesRegex;
using testing::Pair;

class Notifications : public testing::Test {
protected:
    static Notification sample() {
        Notification notification;
        notification.appId = "com.example.app";
        notification.layout = 1;
        notification.places = 11;
        notification.title = {"Tea", "IDS_TEA"};
        notification.content = {"It is ready.", "IDS_READY"};
        notification.icon = "/usr/icon.png";
        notification.indicatorIcon = "/usr/indicator.png";
        notification.launchAppId = "com.example.tea";
        notification.launchExtras = {{"page", "walk"}, {"cup", "2"}};
        return notification;
    }
    std::vector<long long> ids() const {
        std::vector<long long> ids;
        for (const Notification& notification : device_->notifications().all())
            ids.push_back(notification.id);
        return ids;
    }

    support::TemporaryDevice device_;
};

TEST_F(Notifications, AreNoneAtFirst) {
    EXPECT_THAT(device_->notifications().all(), IsEmpty());
    EXPECT_EQ(device_->notifications().find(1), std::nullopt);
}

TEST_F(Notifications, KeepWhatTheyAreMadeOf) {
    EXPECT_EQ(device_->notifications().append(sample()), 1);
    device_.reopen();
    const auto kept = device_->notifications().find(1);
    ASSERT_TRUE(kept);
    EXPECT_EQ(kept->id, 1);
    EXPECT_THAT(kept->time, MatchesRegex("[0-9-]+T[0-9:]+\\.[0-9][0-9][0-9]Z"));
    EXPECT_EQ(kept->appId, "com.example.app");
    EXPECT_EQ(kept->layout, 1);
    EXPECT_EQ(kept->places, 11);
    EXPECT_EQ(kept->title.plain, "Tea");
    EXPECT_EQ(kept->title.id, "IDS_TEA");
    EXPECT_EQ(kept->content.plain, "It is ready.");
    EXPECT_EQ(kept->content.id, "IDS_READY");
    EXPECT_EQ(kept->icon, "/usr/icon.png");
    EXPECT_EQ(kept->indicatorIcon, "/usr/indicator.png");
    EXPECT_EQ(kept->launchAppId, "com.example.tea");
    EXPECT_THAT(kept->launchExtras, ElementsAre(Pair("page", "walk"), Pair("cup", "2")));
}

TEST_F(Notifications, AreListedInTheOrderInWhichTheyCame) {
    Notification without = sample();
    without.launchExtras.clear();
    device_->notifications().append(sample());
    device_->notifications().append(without);
    device_->notifications().append(sample());
    EXPECT_THAT(ids(), ElementsAre(1, 2, 3));
    EXPECT_THAT(device_->notifications().all()[1].launchExtras, IsEmpty());
    EXPECT_EQ(device_->notifications().all()[2].launchExtras.size(), 2U);
}

TEST_F(Notifications, AreTakenAwayAndTheirNumbersNeverGivenAgain) {
    for (int i = 0; i < 3; ++i)
        device_->notifications().append(sample());
    device_->notifications().remove(3);
    device_->notifications().remove(1);
    device_->notifications().remove(4711);
    EXPECT_THAT(ids(), ElementsAre(2));
    EXPECT_EQ(device_->notifications().append(sample()), 4);
    device_->notifications().removeAll();
    EXPECT_THAT(ids(), IsEmpty());
    EXPECT_EQ(device_->notifications().append(sample()), 5);
}

TEST_F(Notifications, SayWhatIsWrongWithTheDatabase) {
    device_->database().sql().exec("DROP TABLE notification");
    EXPECT_THAT(support::messageOf([&] { device_->notifications().append(sample()); }), HasSubstr("device.db"));
    EXPECT_THAT(support::messageOf([&] { (void)device_->notifications().all(); }), HasSubstr("device.db"));
    EXPECT_THAT(support::messageOf([&] { (void)device_->notifications().find(1); }), HasSubstr("device.db"));
    EXPECT_THAT(support::messageOf([&] { device_->notifications().remove(1); }), HasSubstr("device.db"));
    EXPECT_THAT(support::messageOf([&] { device_->notifications().removeAll(); }), HasSubstr("device.db"));
}

}  // namespace
