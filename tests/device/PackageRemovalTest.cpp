#include "device/Packages.h"

#include "InstalledPackages.h"
#include "RefusedRename.h"
#include "support/Message.h"
#include "support/Process.h"

#include <gmock/gmock.h>
#include <gtest/gtest.h>

#include <algorithm>
#include <csignal>
#include <functional>
#include <random>
#include <sys/time.h>

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

TEST_F(PackageRemoval, ChangesNothingWhenTheFolderCannotBeMoved) {
    packages.install(makePackage("com.example.app", "4.0"));
    const auto root = device.root() / "opt/usr/apps/com.example.app";
    {
        const RefusedRename refused([&](const std::string& from) { return from == root; });
        const std::string message = root.string() + ": cannot be removed: Permission denied; move it away by hand";
        EXPECT_EQ(messageOf([&] { packages.uninstall("com.example.app"); }), message);
        EXPECT_EQ(messageOf([&] { device::Packages::removeInstalled(device->folder()); }), message);
    }
    EXPECT_EQ(packages.find("com.example.app")->version, "4.0");
    EXPECT_THAT(remains(), IsEmpty());
}

/// A removal that another process is killed in, at a moment of its own work: at random within a time that becomes
/// shorter when it came too late, and longer when it came too early. So it comes both too late and too early, however
/// fast the machine is.
class KilledRemoval : public PackageRemoval {
protected:
    void SetUp() override {
        for (int number = 0; number < 40; ++number)
            writeFile(update_ / ("res/" + std::to_string(number)), std::string(2000, 'x'));
    }
    /// Has it done sixty times, always from two packages that are installed.
    void repeat(const std::function<void(device::Packages&)>& removal) {
        for (int round = 0; round < 60; ++round) {
            packages.install(update_);
            packages.install(tea_);
            device->database().sql().exec("DELETE FROM package");
            const int microseconds = std::uniform_int_distribution<int>(1, static_cast<int>(longest_) + 1)(random_);
            const int status = Process::ofWork([&] {
                                   device::Device same(device.options());
                                   std::signal(SIGALRM, SIG_DFL);
                                   const itimerval alarm{{0, 0}, {0, microseconds}};
                                   setitimer(ITIMER_REAL, &alarm, nullptr);
                                   removal(same.packages());
                                   return 0;
                               }).wait();
            ASSERT_THAT(status, testing::AnyOf(0, -SIGALRM));
            const bool removed = !std::filesystem::exists(device.root() / "opt/usr/apps/com.example.app");
            longest_ = removed ? longest_ * 0.8 : std::min(longest_ * 1.25, 900000.0);
            ++(removed ? removed_ : left_);
            expectWholeOrGone("com.example.app");
            expectWholeOrGone("com.example.tea");
        }
        EXPECT_GT(removed_, 0);
        EXPECT_GT(left_, 0);
        packages.install(makePackage("com.example.other"));
        EXPECT_THAT(remains(), IsEmpty());
    }
    void expectWholeOrGone(const std::string& id) const {
        const auto root = device.root() / "opt/usr/apps" / id;
        if (!std::filesystem::exists(root))
            return;
        EXPECT_EQ(packages.find(id)->version, id == "com.example.app" ? "4.0" : "1.0.0");
        for (int number = 0; id == "com.example.app" && number < 40; ++number)
            EXPECT_EQ(std::filesystem::file_size(root / ("res/" + std::to_string(number))), 2000U);
    }

    const std::filesystem::path update_ = makePackage("com.example.app", "4.0");
    const std::filesystem::path tea_ = makePackage("com.example.tea");
    std::mt19937 random_{4711};
    double longest_ = 4000;
    int removed_ = 0;
    int left_ = 0;
};

TEST_F(KilledRemoval, IsDoneWholeOrNotAtAll) {
    repeat([](device::Packages& same) { same.uninstall("com.example.app"); });
}

TEST_F(KilledRemoval, OfAllThatIsInstalledLeavesEachWholeOrNotAtAll) {
    repeat([this](device::Packages&) { device::Packages::removeInstalled(device::Folder(device.root())); });
}

}  // namespace
