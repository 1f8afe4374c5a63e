#include "Calls.h"

#include "KestUsageLog.h"

#include "kest/KestDevice.h"

#include <gmock/gmock.h>

using testing::ElementsAre;
using testing::IsEmpty;
using testing::Pair;
using testing::StartsWith;

class UsageLog : public testing::Test, protected KestDevice {
protected:
    /// That all calls for a record were made, whatever each of them gave.
    static void expectAllCalls() {
        EXPECT_THAT(calls::made(),
                    ElementsAre("ravella_log_manager_create", "bundle_create", StartsWith("bundle_add_str app_id"),
                                StartsWith("bundle_add_str feature"), StartsWith("bundle_add_str extra"),
                                StartsWith("ravella_log_manager_insert "), "bundle_free",
                                "ravella_log_manager_destroy"));
        calls::forget();
    }
};

TEST_F(UsageLog, GetsARecordOfAChosenMenu) {
    KestUsageLog::menuChosen("Wi-Fi & \"more\"");
    const auto records = device()->usage().all();
    ASSERT_EQ(records.size(), 1U);
    EXPECT_THAT(records[0].uri, testing::MatchesRegex("content://[^/]+/log/use_app_feature_survey"));
    EXPECT_THAT(records[0].values, ElementsAre(Pair("app_id", "com.ravella.kest"), Pair("extra", "Wi-Fi & \"more\""),
                                               Pair("feature", "KT01")));
}

TEST_F(UsageLog, GetsAnEmptyTitleToo) {
    KestUsageLog::menuChosen("");
    KestUsageLog::menuRequested("");
    EXPECT_THAT(device()->usage().all().at(0).values,
                ElementsAre(Pair("app_id", "com.ravella.kest"), Pair("extra", ""), Pair("feature", "KT01")));
    EXPECT_THAT(device()->usage().all().at(1).values,
                ElementsAre(Pair("app_id", "com.ravella.kest"), Pair("extra", ""), Pair("feature", "KT03")));
}

TEST_F(UsageLog, IsOpenedAndClosedForEachRecord) {
    KestUsageLog::menuChosen("A");
    const std::string uri = device()->usage().all().at(0).uri;
    EXPECT_THAT(calls::made(),
                ElementsAre("ravella_log_manager_create", "bundle_create", "bundle_add_str app_id com.ravella.kest",
                            "bundle_add_str feature KT01", "bundle_add_str extra A",
                            "ravella_log_manager_insert " + uri + " null null number", "bundle_free",
                            "ravella_log_manager_destroy"));
    calls::forget();
    KestUsageLog::menuChosen("B");
    EXPECT_EQ(calls::made().size(), 8U);
    EXPECT_EQ(device()->usage().all().size(), 2U);
}

TEST_F(UsageLog, MayRefuseToOpen) {
    device::faults::plan("ravella_log_manager_create", -5);
    KestUsageLog::menuChosen("A");
    expectAllCalls();
    EXPECT_THAT(device()->usage().all(), IsEmpty());
    EXPECT_THAT(kest_log::all(device()), IsEmpty());
}

TEST_F(UsageLog, MayRefuseARecord) {
    device::faults::plan("ravella_log_manager_insert", -5);
    KestUsageLog::menuChosen("A");
    expectAllCalls();
    EXPECT_THAT(device()->usage().all(), IsEmpty());
    EXPECT_THAT(kest_log::all(device()), IsEmpty());
    KestUsageLog::menuChosen("B");
    EXPECT_EQ(device()->usage().all().size(), 1U);
}

TEST_F(UsageLog, MayRefuseToClose) {
    calls::fail("ravella_log_manager_destroy");
    KestUsageLog::menuChosen("A");
    expectAllCalls();
    EXPECT_EQ(device()->usage().all().size(), 1U);
    EXPECT_THAT(kest_log::all(device()), IsEmpty());
}

TEST_F(UsageLog, MayHaveNoMemoryForARecord) {
    calls::fail("bundle_create");
    KestUsageLog::menuChosen("A");
    expectAllCalls();
    EXPECT_THAT(device()->usage().all(), IsEmpty());
    EXPECT_THAT(kest_log::all(device()), IsEmpty());
}
