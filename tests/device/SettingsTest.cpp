#include "device/Keys.h"
#include "support/TemporaryDevice.h"

#include <gmock/gmock.h>
#include <gtest/gtest.h>

namespace {

using support::TemporaryDevice;
using testing::Contains;
using testing::Pair;

TEST(Settings, AreKeptWhenTheDeviceIsOpenedAnew) {
    TemporaryDevice device;
    device->settings().set("db/some/key", "it's \"quoted\" \xff");
    device.reopen();
    EXPECT_EQ(device->settings().get("db/some/key"), "it's \"quoted\" \xff");
    EXPECT_THAT(device->settings().all(), Contains(Pair("db/some/key", "it's \"quoted\" \xff")));
}

TEST(Settings, AreGoneAfterTheirRemoval) {
    const TemporaryDevice device;
    device->settings().set("key", "value");
    device->settings().remove("key");
    device->settings().remove("never there");
    EXPECT_EQ(device->settings().get("key"), std::nullopt);
}

TEST(Settings, MayBeEmpty) {
    const TemporaryDevice device;
    device->settings().set("", "");
    EXPECT_EQ(device->settings().get(""), "");
}

}  // namespace
