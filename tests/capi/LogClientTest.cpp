#include "ravella-log-client.h"

#include "support/PrivateBus.h"
#include "support/TemporaryDevice.h"

#include <gmock/gmock.h>
#include <gtest/gtest.h>

namespace {

using support::runLoopUntil;
using support::TemporaryDevice;
using testing::ElementsAre;
using testing::IsEmpty;
using testing::Pair;

constexpr char uri[] = "content://com.example.log/log/use";

class LogClient : public testing::Test {
protected:
    LogClient() {
        EXPECT_EQ(ravella_log_manager_create(&manager), TIZEN_ERROR_NONE);
        bundle_add_str(record, "feature", "A1");
        bundle_add_str(record, "app_id", "com.example.app");
    }
    ~LogClient() override {
        ravella_log_manager_destroy(manager);
        bundle_free(record);
    }

    struct Told {
        ravella_log_manager_h toDestroy = nullptr;
        std::vector<std::pair<int, int>> results;
    };
    static void tell(int requestId, int result, void* data) {
        auto* told = static_cast<Told*>(data);
        told->results.emplace_back(requestId, result);
        if (told->toDestroy)
            ravella_log_manager_destroy(told->toDestroy);
    }

    TemporaryDevice device;
    ravella_log_manager_h manager = nullptr;
    bundle* record = bundle_create();
    Told told;
};

TEST_F(LogClient, StoresTheStringsOfTheBundleAtOnce) {
    int id = 0;
    EXPECT_EQ(ravella_log_manager_insert(manager, uri, record, nullptr, nullptr, &id), TIZEN_ERROR_NONE);
    EXPECT_EQ(id, 1);
    EXPECT_EQ(ravella_log_manager_insert(manager, uri, record, nullptr, nullptr, nullptr), TIZEN_ERROR_NONE);
    const auto records = device->usage().all();
    ASSERT_EQ(records.size(), 2U);
    EXPECT_EQ(records[0].uri, uri);
    EXPECT_THAT(records[0].values, ElementsAre(Pair("app_id", "com.example.app"), Pair("feature", "A1")));
}

TEST_F(LogClient, TellsFromTheMainLoopThatARecordWasStored) {
    EXPECT_EQ(ravella_log_manager_insert(manager, uri, record, tell, &told, nullptr), TIZEN_ERROR_NONE);
    EXPECT_EQ(ravella_log_manager_insert(manager, uri, record, tell, &told, nullptr), TIZEN_ERROR_NONE);
    EXPECT_THAT(told.results, IsEmpty());
    EXPECT_TRUE(runLoopUntil([&] { return told.results.size() == 2; }));
    EXPECT_THAT(told.results, ElementsAre(Pair(1, TIZEN_ERROR_NONE), Pair(2, TIZEN_ERROR_NONE)));
}

TEST_F(LogClient, TellsNothingAfterItsEnd) {
    ravella_log_manager_insert(manager, uri, record, tell, &told, nullptr);
    ravella_log_manager_destroy(manager);
    manager = nullptr;
    ravella_log_manager_create(&manager);
    Told later;
    ravella_log_manager_insert(manager, uri, record, tell, &later, nullptr);
    EXPECT_TRUE(runLoopUntil([&] { return later.results.size() == 1; }));
    EXPECT_THAT(told.results, IsEmpty());
}

TEST_F(LogClient, MayBeEndedInsideItsCallback) {
    ravella_log_manager_insert(manager, uri, record, tell, &told, nullptr);
    ravella_log_manager_insert(manager, uri, record, tell, &told, nullptr);
    told.toDestroy = manager;
    manager = nullptr;
    EXPECT_TRUE(runLoopUntil([&] { return !told.results.empty(); }));
    EXPECT_THAT(told.results, ElementsAre(Pair(1, TIZEN_ERROR_NONE)));
}

TEST_F(LogClient, RefusesWhatIsNoContentUriAndNull) {
    for (const char* bad : {"http://example.com/", "", "content:/", "Content://x"})
        EXPECT_EQ(ravella_log_manager_insert(manager, bad, record, nullptr, nullptr, nullptr),
                  TIZEN_ERROR_INVALID_PARAMETER)
            << bad;
    EXPECT_EQ(ravella_log_manager_insert(nullptr, uri, record, nullptr, nullptr, nullptr),
              TIZEN_ERROR_INVALID_PARAMETER);
    EXPECT_EQ(ravella_log_manager_insert(manager, nullptr, record, nullptr, nullptr, nullptr),
              TIZEN_ERROR_INVALID_PARAMETER);
    EXPECT_EQ(ravella_log_manager_insert(manager, uri, nullptr, nullptr, nullptr, nullptr),
              TIZEN_ERROR_INVALID_PARAMETER);
    EXPECT_EQ(ravella_log_manager_create(nullptr), TIZEN_ERROR_INVALID_PARAMETER);
    EXPECT_EQ(ravella_log_manager_destroy(nullptr), TIZEN_ERROR_INVALID_PARAMETER);
    EXPECT_THAT(device->usage().all(), IsEmpty());
}

TEST_F(LogClient, SaysThatARecordCouldNotBeStored) {
    device->database().sql().exec("DROP TABLE usage");
    int id = -1;
    EXPECT_EQ(ravella_log_manager_insert(manager, uri, record, nullptr, nullptr, &id), TIZEN_ERROR_IO_ERROR);
    EXPECT_EQ(id, -1);
}

}  // namespace
