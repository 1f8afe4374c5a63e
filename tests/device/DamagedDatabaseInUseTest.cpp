#include "device/Database.h"

#include "DatabaseOptions.h"
#include "HeldApplicationLock.h"
#include "device/Error.h"
#include "support/Message.h"

#include <gmock/gmock.h>
#include <gtest/gtest.h>

namespace {

using device::Database;
using device::Device;
using support::messageOf;
using support::readFile;
using support::writeFile;
using testing::Contains;
using testing::MatchesRegex;
using testing::Not;

class DamagedDatabaseInUse : public testing::Test {
protected:
    std::string file() const { return options_.folder.database().string(); }
    /// A device with that database.
    void damage() const {
        { const Device device(options_); }
        writeFile(file(), damage_);
    }

    const support::TemporaryFolder there_;
    const Device::Options options_ = optionsFor(there_.path());
    const std::string damage_ = std::string(10000, 'x');
};

TEST_F(DamagedDatabaseInUse, StaysInItsPlaceUntilTheApplicationHasEnded) {
    damage();
    {
        const HeldApplicationLock running(options_.folder, "com.example.app");
        for (int time = 0; time < 2; ++time)
            EXPECT_EQ(messageOf([&] { Device device(options_); }),
                      file() + ": is damaged (file is not a database) while com.example.app runs on it; end that "
                               "application, then try again");
        EXPECT_EQ(readFile(file()), damage_);
        EXPECT_THAT(filesIn(there_.path()), Not(Contains(MatchesRegex(".*damaged.*"))));
    }
    EXPECT_THROW(Device{options_}, device::DamagedError);
    EXPECT_EQ(Device(options_).settings().all().size(), 3U);
}

TEST_F(DamagedDatabaseInUse, IsSetAsideBesideLocksThatNobodyHolds) {
    damage();
    { const HeldApplicationLock ended(options_.folder, "com.example.app"); }
    ASSERT_TRUE(std::filesystem::exists(options_.folder.applicationLock("com.example.app")));
    EXPECT_THROW(Device{options_}, device::DamagedError);
}

TEST_F(DamagedDatabaseInUse, IsToldFromOneThatIsSound) {
    Device device(options_);
    EXPECT_FALSE(device.database().isReplaced());
    writeFile(options_.folder.databaseSuspicion(), "");
    const HeldApplicationLock running(options_.folder, "com.example.app");
    EXPECT_EQ(Device(optionsFor(there_.path(), Database::Check::Full)).settings().all().size(), 3U);
    EXPECT_FALSE(device.database().isReplaced());
}

TEST_F(DamagedDatabaseInUse, IsKnownToBeReplacedByWhoOpenedItBefore) {
    Device device(options_);
    device.database().sql().exec("PRAGMA wal_checkpoint(TRUNCATE)");
    writeFile(file(), damage_);
    EXPECT_FALSE(device.database().isReplaced());
    EXPECT_THROW(Device{options_}, device::DamagedError);
    EXPECT_TRUE(device.database().isReplaced());
    const Device fresh(options_);
    EXPECT_TRUE(device.database().isReplaced());
}

}  // namespace
