#include "device/Packages.h"

#include "InstalledPackages.h"
#include "support/Message.h"

#include <gmock/gmock.h>
#include <gtest/gtest.h>

namespace {

using support::messageOf;
using support::readFile;
using support::writeFile;
using testing::ElementsAre;

/// A folder without a manifest that stands where a device has its packages.
class ForeignFolder : public InstalledPackages {
protected:
    std::filesystem::path make(const std::string& name) const {
        writeFile(device.root() / "opt/usr/apps" / name / "notes.txt", "mine");
        return device.root() / "opt/usr/apps" / name;
    }
    static bool isWhole(const std::filesystem::path& folder) { return readFile(folder / "notes.txt") == "mine"; }
};

TEST_F(ForeignFolder, HidesNoPackageThatTheBuildShips) {
    make("com.example.app");
    EXPECT_EQ(packages.rootOf("com.example.app"), device.preinstalled() / "com.example.app");
    EXPECT_EQ(packages.find("com.example.app")->version, "3.0");
    EXPECT_THAT(idsOf(packages.all()), ElementsAre("com.example.app"));
}

TEST_F(ForeignFolder, IsNoPackageToRemove) {
    const auto notes = make("com.example.notes");
    EXPECT_EQ(messageOf([&] { packages.uninstall("com.example.notes"); }),
              "\"com.example.notes\" is not installed; see the device's list of packages");
    EXPECT_TRUE(isWhole(notes));
}

TEST_F(ForeignFolder, StaysWhenThePackageOfItsNameIsRemoved) {
    const auto notes = make("com.example.app");
    packages.uninstall("com.example.app");
    EXPECT_FALSE(packages.find("com.example.app"));
    EXPECT_TRUE(isWhole(notes));
}

TEST_F(ForeignFolder, StaysWhenAllThatIsInstalledIsRemoved) {
    const auto notes = make("com.example.notes");
    packages.install(makePackage("com.example.tea"));
    packages.install(makePackage("com.example.app", "4.0"));
    EXPECT_THAT(device::Packages::removeInstalled(device->folder()), ElementsAre("com.example.app", "com.example.tea"));
    EXPECT_EQ(packages.find("com.example.app")->version, "3.0");
    EXPECT_FALSE(packages.find("com.example.tea"));
    EXPECT_TRUE(isWhole(notes));
}

}  // namespace
