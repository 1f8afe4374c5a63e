#include "support/Message.h"
#include "support/TemporaryDevice.h"

#include <gmock/gmock.h>
#include <gtest/gtest.h>
#include <sqlite3.h>

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

constexpr char app[] = "com.example.app";

/// A device whose disk takes no large value until it is freed.
class FullDevice : public testing::Test {
protected:
    FullDevice() { device_->database().sql().exec("PRAGMA max_page_count = 20"); }
    void free() { device_->database().sql().exec("PRAGMA max_page_count = 10000"); }
    std::string failureOf(const std::string& key, const std::string& value) {
        return messageOf([&] { device_->preferences().setInOrder(app, key, value); });
    }

    TemporaryDevice device_;
    const std::string full_ = device_.root().string() +
                              "/device.db: the disk is full (database or disk is full); free some space and try again";
};

TEST_F(FullDevice, KeepsNothingThatAnApplicationWritesAfterWhatItCannotKeep) {
    device_->preferences().setInOrder(app, "before", "value");
    EXPECT_EQ(failureOf("long", std::string(1 << 20, 'x')), full_);
    EXPECT_EQ(failureOf("short", "value"), full_);
    EXPECT_THAT(device_->preferences().all(app), ElementsAre(Pair("before", "value")));
}

TEST_F(FullDevice, HasEverythingOnceThereIsSpaceAgain) {
    const std::string large(1 << 20, 'x');
    failureOf("long", large);
    failureOf("short", "old");
    failureOf("short", "new");
    free();
    device_->preferences().setInOrder(app, "last", "value");
    EXPECT_THAT(device_->preferences().all(app),
                ElementsAre(Pair("last", "value"), Pair("long", large), Pair("short", "new")));
}

TEST_F(FullDevice, IsGivenWhatItCouldNotKeepWhenItIsClosed) {
    failureOf("long", std::string(1 << 20, 'x'));
    failureOf("short", "value");
    free();
    device_.reopen();
    EXPECT_EQ(device_->preferences().all(app).size(), 2U);
}

TEST_F(FullDevice, IsGivenNothingMoreAfterTheApplicationsEnd) {
    failureOf("long", std::string(1 << 20, 'x'));
    device_->preferences().finish();
    EXPECT_THAT(device_->preferences().all(app), IsEmpty());
    free();
    device_.reopen();
    EXPECT_THAT(device_->preferences().all(app), IsEmpty());
}

TEST_F(FullDevice, IsNotGivenWhatWasClearedMeanwhile) {
    failureOf("long", std::string(1 << 20, 'x'));
    device_->preferences().clear(app);
    free();
    device_->preferences().setInOrder(app, "last", "value");
    EXPECT_THAT(device_->preferences().all(app), ElementsAre(Pair("last", "value")));

    device_->database().sql().exec("PRAGMA max_page_count = 20");
    failureOf("long", std::string(1 << 20, 'x'));
    device_->preferences().clearAll();
    device_.reopen();
    EXPECT_THAT(device_->preferences().applications(), IsEmpty());
}

TEST_F(FullDevice, IsGivenNothingMoreAfterMoreThanAnybodyKeepsForIt) {
    for (int i = 0; i < 5; ++i)
        EXPECT_EQ(failureOf("long", std::string(1 << 20, 'x')), full_);
    free();
    EXPECT_EQ(failureOf("short", "value"), full_);
    EXPECT_THAT(device_->preferences().all(app), IsEmpty());
}

TEST(Preferences, ThatAnotherProcessKeptFromBeingWrittenAreWrittenLater) {
    TemporaryDevice device;
    SQLite::Database other(device.root() / "device.db", SQLite::OPEN_READWRITE);
    sqlite3_busy_timeout(device->database().sql().getHandle(), 0);
    other.exec("BEGIN IMMEDIATE");
    EXPECT_EQ(messageOf([&] { device->preferences().setInOrder(app, "kept", "value"); }),
              device.root().string() +
                  "/device.db: is held by another process (database is locked); end that process and try again");
    EXPECT_NE(messageOf([&] { device->preferences().setInOrder(app, "next", "value"); }), "");
    EXPECT_EQ(device->database().sql().execAndGet("PRAGMA busy_timeout").getInt(), 5000)
        << "the second one was tried without waiting, and only that";
    other.exec("COMMIT");
    device->preferences().setInOrder(app, "last", "value");
    EXPECT_EQ(device->preferences().all(app).size(), 3U);
}

}  // namespace
