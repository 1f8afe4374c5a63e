#include "device/Packages.h"

#include "InstalledPackages.h"
#include "support/Message.h"
#include "support/Process.h"

#include <gmock/gmock.h>
#include <gtest/gtest.h>

#include <random>

namespace {

using support::messageOf;
using support::Process;
using support::readFile;
using support::writeFile;
using testing::IsEmpty;

class PackageRemoval : public InstalledPackages {
protected:
    void refuseNotes() const {
        for (const char* change : {"INSERT", "UPDATE"})
            device->database().sql().exec(std::string("CREATE TRIGGER refuse_") + change + " BEFORE " + change +
                                          " ON package BEGIN SELECT RAISE(ABORT, 'no'); END");
    }
    std::string failure() const { return device.root().string() + "/device.db: cannot be used (no)"; }
};

TEST_F(PackageRemoval, OfWhatTheBuildShipsChangesNothingWhenItCannotBeNotedDown) {
    refuseNotes();
    EXPECT_EQ(messageOf([&] { packages.uninstall("com.example.app"); }), failure());
    EXPECT_EQ(packages.find("com.example.app")->version, "3.0");
    EXPECT_THAT(remains(), IsEmpty());
}

TEST_F(PackageRemoval, OfAnUpdateOfWhatTheBuildShipsChangesNothingWhenItCannotBeNotedDown) {
    const auto update = makePackage("com.example.app", "4.0");
    writeFile(update / "shared/res/tip.xml", "<tip/>");
    packages.install(update);
    refuseNotes();
    EXPECT_EQ(messageOf([&] { packages.uninstall("com.example.app"); }), failure());
    EXPECT_EQ(packages.find("com.example.app")->version, "4.0");
    EXPECT_EQ(readFile(device.root() / "opt/usr/apps/com.example.app/shared/res/tip.xml"), "<tip/>");
    EXPECT_THAT(remains(), IsEmpty());
}

TEST_F(PackageRemoval, OfWhatTheBuildDoesNotShipNeedsNoNote) {
    packages.install(makePackage("com.example.tea"));
    refuseNotes();
    packages.uninstall("com.example.tea");
    EXPECT_FALSE(packages.find("com.example.tea"));
    EXPECT_FALSE(std::filesystem::exists(device.root() / "opt/usr/apps/com.example.tea"));
    EXPECT_THAT(remains(), IsEmpty());
}

TEST_F(PackageRemoval, OfALinkLeavesWhereItLeads) {
    const auto tea = makePackage("com.example.tea");
    std::filesystem::create_directories(device.root() / "opt/usr/apps");
    std::filesystem::create_directory_symlink(tea, device.root() / "opt/usr/apps/com.example.tea");
    packages.uninstall("com.example.tea");
    EXPECT_FALSE(packages.find("com.example.tea"));
    EXPECT_TRUE(std::filesystem::exists(tea / "tizen-manifest.xml"));
}

TEST_F(PackageRemoval, IsDoneWholeOrNotAtAllWhenItIsKilledAtAnyMoment) {
    const auto update = makePackage("com.example.app", "4.0");
    for (int number = 0; number < 40; ++number)
        writeFile(update / ("res/" + std::to_string(number)), std::string(2000, 'x'));
    std::mt19937 random(4711);
    std::uniform_int_distribution<int> microseconds(0, 8000);
    for (int round = 0; round < 60; ++round) {
        packages.install(update);
        device->database().sql().exec("DELETE FROM package");
        auto remover = Process::ofWork([&] {
            device::Device same(device.options());
            same.packages().uninstall("com.example.app");
            return 0;
        });
        // The moment is the point of this test: a real one, at random, while the remover runs.
        usleep(static_cast<useconds_t>(microseconds(random)));
        remover.end(SIGKILL);
        const auto package = packages.find("com.example.app");
        if (!package)
            continue;
        ASSERT_EQ(package->version, "4.0");
        for (int number = 0; number < 40; ++number)
            ASSERT_EQ(std::filesystem::file_size(package->root / ("res/" + std::to_string(number))), 2000U);
    }
    packages.install(makePackage("com.example.other"));
    EXPECT_THAT(remains(), IsEmpty());
}

}  // namespace
