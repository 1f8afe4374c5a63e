#include "support/Message.h"
#include "support/TemporaryDevice.h"

#include <gmock/gmock.h>
#include <gtest/gtest.h>

namespace {

using support::messageOf;
using support::TemporaryDevice;
using testing::ElementsAre;
using testing::IsEmpty;
using testing::Pair;

TEST(Preferences, GiveNothingForAKeyThatWasNeverSet) {
    const TemporaryDevice device;
    EXPECT_EQ(device->preferences().get("com.example.app", "missing"), std::nullopt);
}

TEST(Preferences, GiveBackWhatWasStoredAlsoAfterTheDeviceIsOpenedAnew) {
    TemporaryDevice device;
    device->preferences().set("com.example.app", "key", "first");
    device->preferences().set("com.example.app", "key", "second");
    device.reopen();
    EXPECT_EQ(device->preferences().get("com.example.app", "key"), "second");
}

TEST(Preferences, KeepEveryByte) {
    const TemporaryDevice device;
    using namespace std::string_literals;
    const std::vector<std::string> texts{""s,
                                         "it's \"quoted\"; DROP TABLE preference; --"s,
                                         "\xff\xfe\x80 no UTF-8"s,
                                         "a zero \0 inside"s,
                                         std::string(1024 * 1024, 'x'),
                                         "\n\r\t"s};
    for (const std::string& text : texts) {
        device->preferences().set("com.example.app", text, text);
        EXPECT_EQ(device->preferences().get("com.example.app", text), text);
    }
    EXPECT_EQ(device->preferences().all("com.example.app").size(), texts.size());
}

TEST(Preferences, AreEachApplicationsOwn) {
    const TemporaryDevice device;
    device->preferences().set("com.example.b", "key", "b");
    device->preferences().set("com.example.a", "key", "a");
    EXPECT_EQ(device->preferences().get("com.example.a", "key"), "a");
    EXPECT_EQ(device->preferences().get("com.example.b", "key"), "b");
    EXPECT_THAT(device->preferences().applications(), ElementsAre("com.example.a", "com.example.b"));

    device->preferences().clear("com.example.a");
    EXPECT_THAT(device->preferences().all("com.example.a"), IsEmpty());
    EXPECT_THAT(device->preferences().all("com.example.b"), ElementsAre(Pair("key", "b")));
}

TEST(Preferences, OfEveryApplicationGoInACustomisationReset) {
    const TemporaryDevice device;
    device->preferences().set("com.example.a", "key", "a");
    device->preferences().set("com.example.b", "key", "b");
    device->preferences().clearAll();
    EXPECT_THAT(device->preferences().applications(), IsEmpty());
}

TEST(Preferences, OfAnApplicationAreWrittenNoMoreOnceAWriteHasFailed) {
    TemporaryDevice device;
    device->database().sql().exec("PRAGMA max_page_count = 20");
    device->preferences().setUnlessOneFailed("com.example.app", "before", "value");
    const std::string failure = messageOf(
        [&] { device->preferences().setUnlessOneFailed("com.example.app", "long", std::string(1 << 20, 'x')); });
    EXPECT_EQ(failure, device.root().string() +
                           "/device.db: the disk is full (database or disk is full); free some space and try again");
    EXPECT_EQ(messageOf([&] { device->preferences().setUnlessOneFailed("com.example.app", "short", "value"); }),
              failure);
    EXPECT_THAT(device->preferences().all("com.example.app"), ElementsAre(Pair("before", "value")));

    device.reopen();
    device->preferences().setUnlessOneFailed("com.example.app", "short", "value");
    EXPECT_EQ(device->preferences().get("com.example.app", "short"), "value");
}

}  // namespace
