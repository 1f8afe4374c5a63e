#include "support/Message.h"
#include "support/TemporaryDevice.h"

#include <gmock/gmock.h>
#include <gtest/gtest.h>

namespace {

using device::LaunchOutcome;
using device::LaunchRecord;
using support::TemporaryDevice;
using testing::ElementsAre;
using testing::IsEmpty;
using testing::MatchesRegex;
using testing::Pair;

TEST(Launches, AreNoneOnAFreshDevice) {
    const TemporaryDevice device;
    EXPECT_THAT(device->launches().all(), IsEmpty());
}

TEST(Launches, AreKeptInTheirOrder) {
    TemporaryDevice device;
    EXPECT_EQ(device->launches().append({"com.example.app", "com.example.tea", {{"cup", "2"}, {"milk", ""}}},
                                        LaunchOutcome::Started),
              1);
    EXPECT_EQ(device->launches().append({"com.example.tea", "com.example.none", {}}, LaunchOutcome::Failed,
                                        "it is not installed"),
              2);
    device.reopen();
    const std::vector<LaunchRecord> records = device->launches().all();
    ASSERT_EQ(records.size(), 2U);
    EXPECT_EQ(records[0].id, 1);
    EXPECT_THAT(records[0].time, MatchesRegex("[0-9]+-[0-9]+-[0-9]+T[0-9]+:[0-9]+:[0-9]+\\.[0-9][0-9][0-9]Z"));
    EXPECT_EQ(records[0].request.caller, "com.example.app");
    EXPECT_EQ(records[0].request.appId, "com.example.tea");
    EXPECT_THAT(records[0].request.extras, ElementsAre(Pair("cup", "2"), Pair("milk", "")));
    EXPECT_EQ(records[0].outcome, LaunchOutcome::Started);
    EXPECT_EQ(records[0].reason, "");
    EXPECT_EQ(records[1].id, 2);
    EXPECT_THAT(records[1].request.extras, IsEmpty());
    EXPECT_EQ(records[1].outcome, LaunchOutcome::Failed);
    EXPECT_EQ(records[1].reason, "it is not installed");
}

TEST(Launches, LearnWhatHasComeOfOne) {
    const TemporaryDevice device;
    device->launches().append({"a.a", "b.b", {}}, LaunchOutcome::Asked);
    const long long second = device->launches().append({"a.a", "b.b", {}}, LaunchOutcome::Asked);
    device->launches().update(second, LaunchOutcome::HandedOver);
    EXPECT_EQ(device->launches().all()[0].outcome, LaunchOutcome::Asked);
    EXPECT_EQ(device->launches().all()[1].outcome, LaunchOutcome::HandedOver);
    device->launches().update(second, LaunchOutcome::Failed, "it ended with status 3");
    EXPECT_EQ(device->launches().all()[1].outcome, LaunchOutcome::Failed);
    EXPECT_EQ(device->launches().all()[1].reason, "it ended with status 3");
}

TEST(Launches, KeepStrangeBytes) {
    const TemporaryDevice device;
    const std::string strange = "\xff'\"\n<b>\\";
    device->launches().append({strange, strange, {{strange, strange}}}, LaunchOutcome::Failed, strange);
    const LaunchRecord record = device->launches().all().front();
    EXPECT_EQ(record.request.caller, strange);
    EXPECT_EQ(record.request.appId, strange);
    EXPECT_THAT(record.request.extras, ElementsAre(Pair(strange, strange)));
    EXPECT_EQ(record.reason, strange);
}

TEST(Launches, SayThatTheDiskIsFull) {
    const TemporaryDevice device;
    device->database().sql().exec("PRAGMA max_page_count = 20");
    const std::string large(1 << 20, 'x');
    EXPECT_EQ(support::messageOf([&] {
                  device->launches().append({"a.a", "b.b", {{"key", large}}}, LaunchOutcome::Started);
              }),
              device.root().string() +
                  "/device.db: the disk is full (database or disk is full); free some space and try again");
    EXPECT_THAT(device->launches().all(), IsEmpty());
}

}  // namespace
