#include "device/Packages.h"

#include "InstalledPackages.h"
#include "support/Message.h"

#include <gmock/gmock.h>
#include <gtest/gtest.h>

namespace {

using device::Package;
using support::messageOf;
using support::readFile;
using support::TemporaryDevice;
using support::writeFile;
using testing::ElementsAre;
using testing::IsEmpty;

using Packages = InstalledPackages;

TEST_F(Packages, ThatTheBuildShipsAreThere) {
    const auto package = packages.find("com.example.app");
    ASSERT_TRUE(package);
    EXPECT_EQ(package->version, "3.0");
    EXPECT_EQ(package->root, device.preinstalled() / "com.example.app");
    EXPECT_EQ(package->label, "Label of com.example.app");
    EXPECT_TRUE(package->preinstalled);
    EXPECT_EQ(packages.rootOf("com.example.app"), device.preinstalled() / "com.example.app");
}

TEST_F(Packages, ThatNobodyInstalledAreNot) {
    for (const char* id : {"com.example.none", "", ".", "..", "../apps/com.example.app", "com.example.app/",
                           "com.example.app/res", "/"}) {
        EXPECT_EQ(packages.rootOf(id), std::nullopt) << id;
        EXPECT_FALSE(packages.find(id)) << id;
    }
}

TEST_F(Packages, AreListedInTheOrderOfTheirIds) {
    device.addPackage("com.example.zebra");
    device.addPackage("com.example.ant");
    packages.install(makePackage("com.example.bee"));
    EXPECT_THAT(idsOf(packages.all()),
                ElementsAre("com.example.ant", "com.example.app", "com.example.bee", "com.example.zebra"));
}

TEST_F(Packages, WithABrokenManifestAreLeftOutOfTheListAndToldOfWhenAskedFor) {
    device.addPackage("com.example.broken");
    const auto manifest = device.preinstalled() / "com.example.broken/tizen-manifest.xml";
    writeFile(manifest, "<manifest");
    EXPECT_THAT(idsOf(packages.all()), ElementsAre("com.example.app"));
    EXPECT_EQ(messageOf([&] { packages.find("com.example.broken"); }),
              manifest.string() + ":1: is not well-formed XML: Couldn't find end of Start Tag manifest line 1");
}

TEST_F(Packages, AreReadAgainWhenTheirManifestHasChanged) {
    const auto manifest = device.preinstalled() / "com.example.one/tizen-manifest.xml";
    for (const char* version : {"1", "1.0", "1.0.2"}) {
        device.addPackage("com.example.one", version);
        // As if it had been there for long.
        std::filesystem::last_write_time(manifest, {});
        for (int time = 0; time < 2; ++time)
            EXPECT_EQ(version, packages.find("com.example.one").value().version);
    }
    std::filesystem::remove(manifest);
    EXPECT_THAT(messageOf([&] { packages.find("com.example.one"); }), testing::HasSubstr("cannot be read"));
}

TEST_F(Packages, MustLieInAFolderOfTheirName) {
    TemporaryDevice::makePackage(device.preinstalled() / "com.example.folder", "com.example.inside");
    EXPECT_EQ(messageOf([&] { packages.find("com.example.folder"); }),
              (device.preinstalled() / "com.example.folder/tizen-manifest.xml").string() +
                  ": the package's id \"com.example.inside\" differs from the name of its folder; they must be equal");
}

TEST_F(Packages, AreInstalledAsACopyOfAllTheirFiles) {
    const auto source = makePackage("com.example.tea");
    writeFile(source / "shared/res/contents/deep/tip.xml", "<tip/>");
    writeFile(source / "bin/app", "#!/bin/sh\n");
    std::filesystem::permissions(source / "bin/app", std::filesystem::perms(0755));
    writeFile(source / "empty", "");
    writeFile(source / "large", std::string(5 << 20, 'x'));
    const Package package = packages.install(source);
    std::filesystem::remove_all(source);

    EXPECT_EQ(package.root, device.root() / "opt/usr/apps/com.example.tea");
    EXPECT_EQ(package.icon, (package.root / "shared/res/icon.png").string());
    EXPECT_FALSE(package.preinstalled);
    EXPECT_EQ(packages.rootOf("com.example.tea"), package.root);
    EXPECT_EQ(readFile(package.root / "shared/res/contents/deep/tip.xml"), "<tip/>");
    EXPECT_EQ(std::filesystem::status(package.root / "bin/app").permissions(), std::filesystem::perms(0755));
    EXPECT_EQ(std::filesystem::file_size(package.root / "large"), 5U << 20);
    EXPECT_TRUE(std::filesystem::exists(package.root / "empty"));
    EXPECT_THAT(remains(), IsEmpty());
}

TEST_F(Packages, StayInstalledWhenTheDeviceIsOpenedAnew) {
    packages.install(makePackage("com.example.tea"));
    device.reopen();
    EXPECT_TRUE(device->packages().find("com.example.tea"));
}

TEST_F(Packages, AreReplacedWholeByAnUpdate) {
    const auto old = makePackage("com.example.tea", "1.0");
    writeFile(old / "only-in-the-old-one", "");
    packages.install(old);
    EXPECT_EQ(packages.install(makePackage("com.example.tea", "2.0")).version, "2.0");
    EXPECT_EQ(packages.find("com.example.tea")->version, "2.0");
    EXPECT_FALSE(std::filesystem::exists(*packages.rootOf("com.example.tea") / "only-in-the-old-one"));
    EXPECT_THAT(remains(), IsEmpty());
}

TEST_F(Packages, OfTheBuildAreCoveredByAnUpdateAndRemovedForGood) {
    packages.install(makePackage("com.example.app", "4.0"));
    EXPECT_EQ(packages.find("com.example.app")->version, "4.0");
    EXPECT_FALSE(packages.find("com.example.app")->preinstalled);
    packages.uninstall("com.example.app");
    device.reopen();
    EXPECT_FALSE(device->packages().find("com.example.app"));
    EXPECT_THAT(device->packages().all(), IsEmpty());
    EXPECT_TRUE(std::filesystem::exists(device.preinstalled() / "com.example.app/tizen-manifest.xml"));
}

TEST_F(Packages, AreGoneWithTheirFilesAfterTheirRemoval) {
    const auto root = packages.install(makePackage("com.example.tea")).root;
    packages.uninstall("com.example.tea");
    EXPECT_EQ(packages.rootOf("com.example.tea"), std::nullopt);
    EXPECT_FALSE(std::filesystem::exists(root));
    EXPECT_EQ(messageOf([&] { packages.uninstall("com.example.tea"); }),
              "\"com.example.tea\" is not installed; see the device's list of packages");
}

TEST_F(Packages, CanComeBackAfterTheirRemoval) {
    packages.uninstall("com.example.app");
    packages.install(makePackage("com.example.app", "5.0"));
    EXPECT_EQ(packages.find("com.example.app")->version, "5.0");
}

TEST_F(Packages, WhoseFolderSomebodyDeletedAreNotInstalled) {
    std::filesystem::remove_all(packages.install(makePackage("com.example.tea")).root);
    EXPECT_FALSE(packages.find("com.example.tea"));
    EXPECT_THAT(idsOf(packages.all()), ElementsAre("com.example.app"));
}

TEST_F(Packages, OfTheFirstOfSeveralFoldersWin) {
    const auto second = device.folder() / "second";
    TemporaryDevice::makePackage(second / "com.example.app", "com.example.app", "9.9");
    TemporaryDevice::makePackage(second / "com.example.more", "com.example.more");
    device::Device::Options options = device.options();
    options.preinstalled.push_back(second);
    device::Device same(options);
    EXPECT_EQ(same.packages().find("com.example.app")->version, "3.0");
    EXPECT_THAT(idsOf(same.packages().all()), ElementsAre("com.example.app", "com.example.more"));
}

}  // namespace
