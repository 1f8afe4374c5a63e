#include "support/FullDisk.h"
#include "support/Message.h"
#include "support/TemporaryDevice.h"

#include <gmock/gmock.h>
#include <gtest/gtest.h>

namespace {

using device::Database;
using device::Device;
using support::TemporaryFolder;
using testing::ElementsAre;
using testing::HasSubstr;
using testing::IsEmpty;
using testing::Pair;

/// The first version's schema, as devices have it that were made with it.
constexpr char firstSchema[] = R"(
PRAGMA journal_mode = WAL;
CREATE TABLE setting (key TEXT PRIMARY KEY NOT NULL, value TEXT NOT NULL);
CREATE TABLE preference (app_id TEXT NOT NULL, key TEXT NOT NULL, value TEXT NOT NULL, PRIMARY KEY (app_id, key));
CREATE TABLE package (id TEXT PRIMARY KEY NOT NULL, state TEXT NOT NULL CHECK (state IN ('installed', 'removed')));
CREATE TABLE usage (
    id INTEGER PRIMARY KEY AUTOINCREMENT, time TEXT NOT NULL, uri TEXT NOT NULL, record TEXT NOT NULL);
INSERT INTO setting VALUES ('db/menu_widget/language', 'ko_KR.UTF-8');
INSERT INTO preference VALUES ('com.example.app', 'cup', 'full');
INSERT INTO package VALUES ('com.example.gone', 'removed');
INSERT INTO usage (time, uri, record) VALUES ('2026-01-31T12:00:00.000Z', 'content://x', '{"feature":"A1"}');
PRAGMA user_version = 1;
)";

/// What the second version added to it.
constexpr char secondSchema[] = R"(
CREATE TABLE launch (
    id INTEGER PRIMARY KEY AUTOINCREMENT, time TEXT NOT NULL, caller TEXT NOT NULL, app_id TEXT NOT NULL,
    extras TEXT NOT NULL, outcome TEXT NOT NULL, reason TEXT NOT NULL);
INSERT INTO launch (time, caller, app_id, extras, outcome, reason)
    VALUES ('2026-02-01T12:00:00.000Z', 'com.example.app', 'com.example.tea', '{"page":"walk"}', 'started', '');
PRAGMA user_version = 2;
)";

/// A device that an earlier build has made.
class OldDevice : public testing::Test {
protected:
    OldDevice() {
        std::filesystem::create_directories(root());
        SQLite::Database((root() / "device.db").string(), SQLite::OPEN_READWRITE | SQLite::OPEN_CREATE)
            .exec(firstSchema);
    }
    std::filesystem::path root() const { return there_.path() / "device"; }
    Device::Options options(Database::Check check = Database::Check::Full) const {
        return {device::Folder(root()), {}, there_.path(), check};
    }
    int version() const {
        return SQLite::Database((root() / "device.db").string()).execAndGet("PRAGMA user_version").getInt();
    }

    TemporaryFolder there_;
};

TEST_F(OldDevice, IsTakenOverWithAllThatItHas) {
    Device device(options());
    EXPECT_THAT(device.settings().all(), ElementsAre(Pair("db/menu_widget/language", "ko_KR.UTF-8")));
    EXPECT_THAT(device.preferences().all("com.example.app"), ElementsAre(Pair("cup", "full")));
    EXPECT_EQ(device.usage().all().size(), 1U);
    EXPECT_THAT(device.launches().all(), IsEmpty());
    EXPECT_EQ(device.launches().append({"a.a", "b.b", {}}, device::LaunchOutcome::Started), 1);
    EXPECT_THAT(device.notifications().all(), IsEmpty());
    EXPECT_EQ(version(), 3);
}

TEST_F(OldDevice, OfTheSecondVersionIsTakenOverWithItsLaunches) {
    SQLite::Database((root() / "device.db").string(), SQLite::OPEN_READWRITE).exec(secondSchema);
    Device device(options());
    EXPECT_THAT(device.settings().all(), ElementsAre(Pair("db/menu_widget/language", "ko_KR.UTF-8")));
    ASSERT_EQ(device.launches().all().size(), 1U);
    EXPECT_EQ(device.launches().all()[0].request.appId, "com.example.tea");
    device::Notification notification;
    notification.appId = "com.example.app";
    EXPECT_EQ(device.notifications().append(notification), 1);
    EXPECT_EQ(version(), 3);
}

TEST_F(OldDevice, IsTakenOverOnce) {
    { Device(options(Database::Check::Quick)).launches().append({"a.a", "b.b", {}}, device::LaunchOutcome::Started); }
    EXPECT_EQ(Device(options(Database::Check::Quick)).launches().all().size(), 1U);
}

TEST_F(OldDevice, StaysAsItIsWhereTheDiskBecomesFullAtAnyMoment) {
    // What is written goes behind what another process has written already, past the size of SQLite's other files.
    SQLite::Database other((root() / "device.db").string(), SQLite::OPEN_READWRITE);
    other.exec("PRAGMA wal_autocheckpoint = 0; INSERT INTO preference VALUES ('a.a', 'key', hex(zeroblob(50000)));");
    const rlim_t written = std::filesystem::file_size(root() / "device.db-wal");
    int failures = 0;
    for (rlim_t more = 0; other.execAndGet("PRAGMA user_version").getInt() == 1; more += 500) {
        ASSERT_LT(more, rlim_t{1} << 20);
        const support::FullDisk full(written + more);
        const std::string message = support::messageOf([&] { Device device(options()); });
        if (message == "no error")
            break;
        EXPECT_THAT(message, HasSubstr("device.db: cannot be read or written (disk I/O error)"));
        ++failures;
    }
    EXPECT_GT(failures, 5);
    EXPECT_EQ(Device(options()).usage().all().size(), 1U);
    EXPECT_EQ(Device(options()).launches().all().size(), 0U);
    EXPECT_EQ(Device(options()).notifications().all().size(), 0U);
}

TEST_F(OldDevice, ThatLacksATableIsSetAside) {
    SQLite::Database((root() / "device.db").string(), SQLite::OPEN_READWRITE).exec("DROP TABLE usage");
    EXPECT_THAT(support::messageOf([&] { Device device(options()); }), HasSubstr("it is no database of a device"));
}

}  // namespace
