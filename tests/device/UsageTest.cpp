#include "support/TemporaryDevice.h"

#include <gmock/gmock.h>
#include <gtest/gtest.h>

namespace {

using support::TemporaryDevice;
using testing::ElementsAre;
using testing::IsEmpty;
using testing::MatchesRegex;
using testing::Pair;

TEST(Usage, IsEmptyOnAFreshDevice) {
    const TemporaryDevice device;
    EXPECT_THAT(device->usage().all(), IsEmpty());
}

TEST(Usage, KeepsTheRecordsInTheirOrder) {
    TemporaryDevice device;
    EXPECT_EQ(device->usage().append("content://log/one", {{"app_id", "com.example.app"}, {"feature", "A1"}}), 1);
    EXPECT_EQ(device->usage().append("content://log/two", {}), 2);
    device.reopen();
    const auto records = device->usage().all();
    ASSERT_EQ(records.size(), 2U);
    EXPECT_EQ(records[0].id, 1);
    EXPECT_EQ(records[0].uri, "content://log/one");
    EXPECT_THAT(records[0].time, MatchesRegex("[0-9]+-[0-9]+-[0-9]+T[0-9]+:[0-9]+:[0-9]+\\.[0-9][0-9][0-9]Z"));
    EXPECT_THAT(records[0].values, ElementsAre(Pair("app_id", "com.example.app"), Pair("feature", "A1")));
    EXPECT_EQ(records[1].id, 2);
    EXPECT_THAT(records[1].values, IsEmpty());
}

TEST(Usage, NeverGivesANumberTwice) {
    const TemporaryDevice device;
    EXPECT_EQ(device->usage().append("content://log/one", {}), 1);
    device->database().sql().exec("DELETE FROM usage");
    EXPECT_EQ(device->usage().append("content://log/two", {}), 2);
}

TEST(Usage, KeepsEveryByteOfKeysAndValues) {
    const TemporaryDevice device;
    const std::vector<std::pair<std::string, std::string>> values{
        {"", "empty key"},
        {"$.path \"quoted\"", "it's \\ \"quoted\" {\"a\": [1]}"},
        {"bytes \xff", "\xfe\x80"},
        {"control\n\t\x01", "\r\n\x1b[0m"},
        {"empty", ""},
        {"null", "null"},
        {"number", "42"},
        {"long", std::string(1024 * 1024, 'x')},
        {"words", "한국어 и русский"}};
    device->usage().append("content://log/one", values);
    ASSERT_EQ(device->usage().all().size(), 1U);
    EXPECT_EQ(device->usage().all()[0].values, values);
}

TEST(Usage, IsStoredAsAJsonObjectOfStrings) {
    const TemporaryDevice device;
    device->usage().append("content://log/one", {{"feature", "A1"}, {"extra", "Tea \"time\""}});
    EXPECT_EQ(device->database().sql().execAndGet("SELECT record FROM usage").getString(),
              R"({"feature":"A1","extra":"Tea \"time\""})");
}

}  // namespace
