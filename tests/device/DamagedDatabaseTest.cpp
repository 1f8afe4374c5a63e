#include "device/Database.h"

#include "DatabaseOptions.h"
#include "device/Error.h"
#include "support/Message.h"
#include "support/Process.h"

#include <gmock/gmock.h>
#include <gtest/gtest.h>

namespace {

using device::Database;
using device::Device;
using support::messageOf;
using support::Process;
using support::readFile;
using support::TemporaryFolder;
using support::writeFile;
using testing::MatchesRegex;
using testing::UnorderedElementsAre;

/// One way of damaging a database file, and what SQLite says of it.
struct Damage {
    const char* name;
    std::function<void(std::string&)> change;
    Database::Check check;
    const char* reason;
};

void PrintTo(const Damage& damage, std::ostream* stream) {
    *stream << damage.name;
}

class DamagedDatabase : public testing::TestWithParam<Damage> {};

TEST_P(DamagedDatabase, IsSetAsideAndReplacedByAFreshOne) {
    const TemporaryFolder there;
    const auto options = optionsFor(there.path() / "device", GetParam().check);
    const std::string file = options.folder.database().string();
    {
        Device device(options);
        for (int number = 0; number < 50; ++number)
            device.preferences().set("com.example.app", std::to_string(number), std::string(2000, 'x'));
    }
    std::string damaged = readFile(file);
    GetParam().change(damaged);
    writeFile(file, damaged);

    const std::string line = messageOf([&] { Device device(options); });
    const std::string aside = file + "\\.damaged-[0-9]+T[0-9]+Z";
    ASSERT_THAT(line, MatchesRegex(file + ": is damaged \\(" + GetParam().reason + "\\); it was renamed to " + aside +
                                   " and the device begins with a fresh database; `sqlite3 " + aside +
                                   " \\.recover` prints what can be saved of the old one"));
    const std::size_t name = line.find("renamed to ") + 11;
    EXPECT_EQ(readFile(line.substr(name, line.find(' ', name) - name)), damaged);

    Device device(options);
    EXPECT_EQ(device.settings().all().size(), 3U);
    EXPECT_TRUE(device.preferences().applications().empty());
}

INSTANTIATE_TEST_SUITE_P(
    , DamagedDatabase,
    testing::Values(
        Damage{"NoDatabase", [](std::string& bytes) { bytes = std::string(10000, 'x'); }, Database::Check::Quick,
               "file is not a database"},
        Damage{"OneByteOnly", [](std::string& bytes) { bytes = "x"; }, Database::Check::Quick, "it is cut short"},
        Damage{"HalfAPage", [](std::string& bytes) { bytes.resize(2048); }, Database::Check::Quick,
               "database disk image is malformed"},
        Damage{"Magic", [](std::string& bytes) { bytes[3] = 'X'; }, Database::Check::Quick, "file is not a database"},
        Damage{"PageSize", [](std::string& bytes) { bytes[16] = bytes[17] = 0x7f; }, Database::Check::Quick,
               "file is not a database"},
        Damage{"FileFormat", [](std::string& bytes) { bytes[18] = 9; }, Database::Check::Quick,
               "its header names an unknown format"},
        Damage{"SchemaFormat", [](std::string& bytes) { bytes[47] = 9; }, Database::Check::Quick,
               "unsupported file format"},
        Damage{"SchemaPage", [](std::string& bytes) { bytes.replace(100, 3900, 3900, '\xee'); }, Database::Check::Quick,
               "database disk image is malformed"},
        Damage{"OtherPages", [](std::string& bytes) { bytes.replace(20 * 4096, 4096, 4096, '\xee'); },
               Database::Check::Full, "[^\n]*[Pp]age[^\n]*"},
        Damage{"CutShort", [](std::string& bytes) { bytes.resize(bytes.size() - 5 * 4096 - 7); }, Database::Check::Full,
               "database disk image is malformed"}),
    [](const auto& damage) { return damage.param.name; });

TEST(Database, OfSomethingElseIsSetAside) {
    const TemporaryFolder there;
    const auto options = optionsFor(there.path());
    {
        SQLite::Database other(options.folder.database().string(), SQLite::OPEN_READWRITE | SQLite::OPEN_CREATE);
        other.exec("CREATE TABLE stranger (id INTEGER)");
    }
    EXPECT_THAT(
        messageOf([&] { Device device(options); }),
        MatchesRegex(options.folder.database().string() + ": is damaged \\(it is no database of a device\\);.*"));
}

TEST(Database, IsSetAsideTogetherWithItsLog) {
    const TemporaryFolder there;
    const auto options = optionsFor(there.path());
    writeFile(options.folder.database(), std::string(10000, 'x'));
    writeFile(options.folder.database().string() + "-wal", "log");
    writeFile(options.folder.database().string() + "-shm", "index");
    EXPECT_THROW(Device{options}, device::DamagedError);
    EXPECT_THAT(filesIn(there.path()),
                UnorderedElementsAre("device.db.lock", MatchesRegex("device\\.db\\.damaged-[0-9TZ]+"),
                                     MatchesRegex("device\\.db\\.damaged-[0-9TZ]+-wal"),
                                     MatchesRegex("device\\.db\\.damaged-[0-9TZ]+-shm")));
}

TEST(Database, ThatIsDamagedAgainWithinASecondGetsANameOfItsOwn) {
    const TemporaryFolder there;
    const auto options = optionsFor(there.path());
    for (int number = 0; number < 5; ++number) {
        writeFile(options.folder.database(), "damage " + std::to_string(number) + std::string(5000, 'x'));
        EXPECT_THROW(Device{options}, device::DamagedError);
    }
    std::vector<std::string> kept;
    for (const std::string& name : filesIn(there.path()))
        if (name.find(".damaged-") != std::string::npos)
            kept.push_back(readFile(there.path() / name).substr(0, 8));
    EXPECT_THAT(kept, UnorderedElementsAre("damage 0", "damage 1", "damage 2", "damage 3", "damage 4"));
}

TEST(Database, ThatIsDamagedIsSetAsideByOneOfManyProcesses) {
    const TemporaryFolder there;
    const auto options = optionsFor(there.path());
    writeFile(options.folder.database(), std::string(10000, 'x'));
    std::vector<Process> processes;
    processes.reserve(6);
    for (int number = 0; number < 6; ++number)
        processes.push_back(Process::ofWork([&] {
            try {
                Device device(options);
                return 0;
            } catch (const device::DamagedError&) {
                return 1;
            }
        }));
    int setAside = 0;
    for (Process& process : processes)
        setAside += process.wait();
    EXPECT_EQ(setAside, 1);
    EXPECT_EQ(Device(options).settings().all().size(), 3U);
}

TEST(Database, WhoseDamageShowsInUseIsCheckedWholeAtTheNextStart) {
    const TemporaryFolder there;
    const auto options = optionsFor(there.path());
    const std::string file = options.folder.database().string();
    {
        Device device(options);
        for (int number = 0; number < 50; ++number)
            device.preferences().set("com.example.app", std::to_string(number), std::string(2000, 'x'));
    }
    std::string bytes = readFile(file);
    bytes.replace(4096, bytes.size() - 4096, bytes.size() - 4096, '\xee');
    writeFile(file, bytes);
    {
        Device device(options);
        EXPECT_EQ(messageOf([&] { device.preferences().all("com.example.app"); }),
                  file + ": is damaged (database disk image is malformed); start the device anew, which sets the file "
                         "aside");
    }
    EXPECT_THROW(Device{options}, device::DamagedError);
    EXPECT_EQ(Device(options).settings().all().size(), 3U);
    EXPECT_FALSE(std::filesystem::exists(options.folder.databaseSuspicion()));
}

}  // namespace
