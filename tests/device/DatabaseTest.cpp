#include "device/Database.h"

#include "DatabaseOptions.h"
#include "device/Keys.h"
#include "support/Message.h"
#include "support/Privileges.h"
#include "support/Process.h"

#include <gmock/gmock.h>
#include <gtest/gtest.h>

#include <random>
#include <sys/resource.h>

namespace {

using device::Database;
using device::Device;
using support::messageOf;
using support::Process;
using support::TemporaryDevice;
using support::TemporaryFolder;
using testing::ElementsAre;
using testing::Pair;

TEST(Database, OfAFreshDeviceHoldsItsFirstSettings) {
    const TemporaryDevice device;
    EXPECT_THAT(device->settings().all(),
                ElementsAre(Pair("db/display/profile", "720x1280"), Pair("db/menu_widget/language", "en_US.UTF-8"),
                            Pair("db/setting/theme", "light")));
    EXPECT_EQ(device->settings().get(device::keys::country), std::nullopt);
}

TEST(Database, IsWrittenAheadAndCarriesTheVersionOfItsSchema) {
    const TemporaryDevice device;
    SQLite::Database& sql = device->database().sql();
    EXPECT_EQ(sql.execAndGet("PRAGMA journal_mode").getString(), "wal");
    EXPECT_EQ(sql.execAndGet("PRAGMA synchronous").getInt(), 1);
    EXPECT_EQ(sql.execAndGet("PRAGMA busy_timeout").getInt(), 5000);
    EXPECT_EQ(sql.execAndGet("PRAGMA user_version").getInt(), 3);
}

TEST(Database, IsItsUsersAloneInAFolderThatEverybodyReads) {
    const TemporaryFolder there;
    const auto options = optionsFor(there.path() / "device");
    std::filesystem::create_directory(options.folder.root());
    std::filesystem::permissions(options.folder.root(), std::filesystem::perms(0755));
    Device device(options);
    device.preferences().set("com.example.app", "key", "value");
    for (const auto& file : std::filesystem::directory_iterator(options.folder.root()))
        EXPECT_EQ(std::filesystem::status(file).permissions(), std::filesystem::perms(0600)) << file.path();
}

TEST(Database, IsMadeOnceWhenManyProcessesMakeIt) {
    const TemporaryFolder there;
    std::vector<Process> processes;
    processes.reserve(8);
    for (int number = 0; number < 8; ++number)
        processes.push_back(Process::ofWork([&, number] {
            Device device(optionsFor(there.path() / "device"));
            device.preferences().set("com.example.app", std::to_string(number), "written");
            return 0;
        }));
    for (Process& process : processes)
        EXPECT_EQ(process.wait(), 0);
    Device device(optionsFor(there.path() / "device", Database::Check::Full));
    EXPECT_EQ(device.preferences().all("com.example.app").size(), 8U);
    EXPECT_EQ(device.settings().all().size(), 3U);
}

TEST(Database, TakesTheWritesOfTwoProcessesAtOnce) {
    const TemporaryDevice device;
    const auto writer = [&](const std::string& name) {
        return Process::ofWork([&, name] {
            Device same(device.options());
            for (int number = 0; number < 300; ++number)
                same.preferences().set("com.example.app", name + std::to_string(number), std::string(500, 'x'));
            return 0;
        });
    };
    Process first = writer("first");
    Process second = writer("second");
    EXPECT_EQ(first.wait(), 0);
    EXPECT_EQ(second.wait(), 0);
    EXPECT_EQ(device->preferences().all("com.example.app").size(), 600U);
}

TEST(Database, IsSoundAfterAWriterIsKilledAtAnyMoment) {
    const TemporaryFolder there;
    const auto options = optionsFor(there.path() / "device", Database::Check::Full);
    std::mt19937 random(4711);
    std::uniform_int_distribution<int> microseconds(0, 20000);
    for (int round = 0; round < 40; ++round) {
        auto writer = Process::ofWork([&] {
            Device device(options);
            for (int number = 0;; ++number)
                device.preferences().set("com.example.app", std::to_string(number % 200), std::string(2000, 'x'));
            return 0;
        });
        // The moment is the point of this test: a real one, at random, while the writer runs.
        usleep(static_cast<useconds_t>(microseconds(random)));
        writer.end(SIGKILL);
        Device device(options);
        EXPECT_EQ(device.settings().all().size(), 3U);
        for (const auto& [key, value] : device.preferences().all("com.example.app"))
            ASSERT_EQ(value, std::string(2000, 'x')) << key;
    }
    for (const std::string& name : filesIn(there.path() / "device"))
        EXPECT_EQ(name.find("damaged"), std::string::npos) << name;
}

TEST(Database, OfANewerVersionIsLeftAlone) {
    TemporaryDevice device;
    device->database().sql().exec("PRAGMA user_version = 7");
    EXPECT_EQ(messageOf([&] { device.reopen(); }),
              device.root().string() +
                  "/device.db: was made by a newer version of this software (schema 7, this one knows 3); use that "
                  "version, or another folder with KEST_DEVICE");
    SQLite::Database untouched((device.root() / "device.db").string());
    EXPECT_EQ(untouched.execAndGet("PRAGMA user_version").getInt(), 7);
}

TEST(Database, MustBeAFile) {
    const TemporaryFolder there;
    std::filesystem::create_directory(there.path() / "device.db");
    EXPECT_EQ(messageOf([&] { Device device(optionsFor(there.path())); }),
              there.path().string() +
                  "/device.db: is not a file; move it away, and the device begins with a fresh database");
    std::filesystem::remove(there.path() / "device.db");
    ASSERT_EQ(mkfifo((there.path() / "device.db").c_str(), 0600), 0);
    EXPECT_EQ(messageOf([&] { Device device(optionsFor(there.path())); }),
              there.path().string() +
                  "/device.db: is not a file; move it away, and the device begins with a fresh database");
}

TEST(Database, ThatMayNotBeWrittenIsToldOf) {
    const TemporaryFolder there;
    const auto options = optionsFor(there.path() / "device");
    std::make_unique<Device>(options).reset();
    auto other = Process::ofWork([&] {
        std::filesystem::permissions(options.folder.database(), std::filesystem::perms(0444));
        if (!support::obeyPermissions())
            return 2;
        return messageOf([&] { Device device(options); }) ==
                       options.folder.database().string() +
                           ": cannot be written; make it and its folder writable for this user"
                   ? 0
                   : 1;
    });
    EXPECT_EQ(other.wait(), 0);
}

TEST(Database, ThatIsFullSaysSoAndLosesNothing) {
    const TemporaryDevice device;
    device->preferences().set("com.example.app", "before", "kept");
    device->database().sql().exec("PRAGMA max_page_count = 20");
    EXPECT_EQ(messageOf([&] { device->preferences().set("com.example.app", "big", std::string(1 << 20, 'x')); }),
              device.root().string() +
                  "/device.db: the disk is full (database or disk is full); free some space and try again");
    EXPECT_EQ(device->preferences().get("com.example.app", "before"), "kept");
    EXPECT_EQ(device->preferences().get("com.example.app", "big"), std::nullopt);
    device->preferences().set("com.example.app", "small", "fits");
    EXPECT_EQ(device->preferences().get("com.example.app", "small"), "fits");
}

TEST(Database, OnADiskThatIsFullSaysSoAndIsSoundAfterwards) {
    const TemporaryDevice device;
    auto writer = Process::ofWork([&] {
        signal(SIGXFSZ, SIG_IGN);
        Device same(device.options());
        same.preferences().set("com.example.app", "before", "kept");
        const rlimit limit{200 * 1024, 200 * 1024};
        setrlimit(RLIMIT_FSIZE, &limit);
        const std::string line =
            messageOf([&] { same.preferences().set("com.example.app", "big", std::string(1 << 20, 'x')); });
        if (line != device.root().string() + "/device.db: cannot be read or written (disk I/O error); check that its "
                                             "disk is neither full nor broken")
            return 1;
        return same.preferences().get("com.example.app", "before") == "kept" ? 0 : 2;
    });
    EXPECT_EQ(writer.wait(), 0);
    Device same(device.options(Database::Check::Full));
    EXPECT_EQ(same.preferences().get("com.example.app", "before"), "kept");
    EXPECT_EQ(same.preferences().get("com.example.app", "big"), std::nullopt);
}

TEST(Database, ThatCannotBeMadeOnAFullDiskSaysSo) {
    const TemporaryFolder there;
    auto maker = Process::ofWork([&] {
        signal(SIGXFSZ, SIG_IGN);
        const rlimit limit{2000, 2000};
        setrlimit(RLIMIT_FSIZE, &limit);
        const std::string line = messageOf([&] { Device device(optionsFor(there.path())); });
        return line == there.path().string() + "/device.db: cannot be read or written (disk I/O error); check that its "
                                               "disk is neither full nor broken"
                   ? 0
                   : 1;
    });
    EXPECT_EQ(maker.wait(), 0);
    EXPECT_EQ(Device(optionsFor(there.path(), Database::Check::Full)).settings().all().size(), 3U);
}

TEST(Database, ThatAnotherProcessHoldsSaysSo) {
    const TemporaryDevice device;
    device->database().sql().exec("PRAGMA busy_timeout = 1");
    SQLite::Database other((device.root() / "device.db").string(), SQLite::OPEN_READWRITE);
    other.exec("BEGIN IMMEDIATE");
    EXPECT_EQ(messageOf([&] { device->preferences().set("com.example.app", "key", "value"); }),
              device.root().string() +
                  "/device.db: is held by another process (database is locked); end that process and try again");
    other.exec("ROLLBACK");
    device->preferences().set("com.example.app", "key", "value");
    EXPECT_EQ(device->preferences().get("com.example.app", "key"), "value");
}

TEST(Database, FailureInOneStatementDoesNotSpoilTheNextUseOfIt) {
    const TemporaryDevice device;
    SQLite::Database& sql = device->database().sql();
    sql.exec("CREATE TRIGGER refuse BEFORE INSERT ON preference BEGIN SELECT RAISE(ABORT, 'refused'); END");
    EXPECT_EQ(messageOf([&] { device->preferences().set("com.example.app", "key", "value"); }),
              device.root().string() + "/device.db: cannot be used (refused)");
    sql.exec("DROP TRIGGER refuse");
    device->preferences().set("com.example.app", "key", "value");
    EXPECT_EQ(device->preferences().get("com.example.app", "key"), "value");
}

}  // namespace
