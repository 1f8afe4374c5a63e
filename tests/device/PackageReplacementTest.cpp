#include "device/Packages.h"

#include "InstalledPackages.h"
#include "RefusedRename.h"
#include "support/Message.h"

#include <gmock/gmock.h>
#include <gtest/gtest.h>

namespace {

using support::messageOf;
using support::readFile;
using support::writeFile;
using testing::IsEmpty;

/// An update where the file system cannot have two folders change places.
class PackageReplacement : public InstalledPackages {
protected:
    void SetUp() override {
        writeFile(old_ / "res/only-in-the-old-one", "old");
        writeFile(update_ / "res/only-in-the-new-one", "new");
        packages.install(old_);
    }

    const std::filesystem::path old_ = makePackage("com.example.tea", "1.0");
    const std::filesystem::path update_ = makePackage("com.example.tea", "2.0");
    const std::filesystem::path root_ = device.root() / "opt/usr/apps/com.example.tea";
};

TEST_F(PackageReplacement, IsWhole) {
    const RefusedRename none([](const std::string&) { return false; }, false);
    EXPECT_EQ(packages.install(update_).version, "2.0");
    EXPECT_EQ(readFile(root_ / "res/only-in-the-new-one"), "new");
    EXPECT_FALSE(std::filesystem::exists(root_ / "res/only-in-the-old-one"));
    EXPECT_THAT(remains(), IsEmpty());
}

TEST_F(PackageReplacement, PutsTheOldOneBackWhenTheNewOneCannotComeInItsPlace) {
    {
        const auto isNew = [](const std::string& from) {
            return from.find(".installing-") != std::string::npos && !from.ends_with("-old");
        };
        const RefusedRename ofTheNewOne(isNew, false);
        EXPECT_EQ(messageOf([&] { packages.install(update_); }),
                  root_.string() + ": cannot be replaced: Permission denied");
    }
    ASSERT_TRUE(packages.find("com.example.tea"));
    EXPECT_EQ(packages.find("com.example.tea")->version, "1.0");
    EXPECT_EQ(readFile(root_ / "res/only-in-the-old-one"), "old");
    EXPECT_THAT(remains(), IsEmpty());
}

TEST_F(PackageReplacement, ChangesNothingWhenTheOldOneCannotGo) {
    {
        const RefusedRename ofTheOldOne([&](const std::string& from) { return from == root_; }, false);
        EXPECT_EQ(messageOf([&] { packages.install(update_); }),
                  root_.string() + ": cannot be replaced: Invalid argument");
    }
    ASSERT_TRUE(packages.find("com.example.tea"));
    EXPECT_EQ(packages.find("com.example.tea")->version, "1.0");
    EXPECT_THAT(remains(), IsEmpty());
}

}  // namespace
