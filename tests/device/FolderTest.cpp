#include "device/Folder.h"

#include "device/Error.h"
#include "support/Environment.h"
#include "support/Message.h"
#include "support/Privileges.h"
#include "support/Process.h"
#include "support/TemporaryFolder.h"

#include <gtest/gtest.h>
#include <sys/stat.h>

namespace {

using device::Folder;
using support::Environment;
using support::messageOf;
using support::Process;
using support::TemporaryFolder;
using support::writeFile;

class FolderOfTheEnvironment : public testing::Test {
protected:
    Environment device{"KEST_DEVICE", std::nullopt};
    Environment state{"XDG_STATE_HOME", std::nullopt};
    Environment home{"HOME", std::nullopt};
};

TEST_F(FolderOfTheEnvironment, IsTheNamedOneFirst) {
    const Environment named("KEST_DEVICE", "/nowhere/device");
    const Environment stateHome("XDG_STATE_HOME", "/nowhere/state");
    EXPECT_EQ(Folder::resolve().root(), "/nowhere/device");
}

TEST_F(FolderOfTheEnvironment, IsBelowTheStateHomeNext) {
    const Environment stateHome("XDG_STATE_HOME", "/nowhere/state");
    const Environment userHome("HOME", "/nowhere/home");
    EXPECT_EQ(Folder::resolve().root(), "/nowhere/state/kest-device");
}

TEST_F(FolderOfTheEnvironment, IsBelowTheHomeAtLastAlsoWhenTheOthersAreEmptyOrRelative) {
    const Environment named("KEST_DEVICE", "");
    const Environment stateHome("XDG_STATE_HOME", "relative");
    const Environment userHome("HOME", "/nowhere/home");
    EXPECT_EQ(Folder::resolve().root(), "/nowhere/home/.local/state/kest-device");
}

TEST_F(FolderOfTheEnvironment, IsAskedForWhenNothingNamesIt) {
    EXPECT_EQ(messageOf([] { Folder::resolve(); }),
              "no folder for the device: none of KEST_DEVICE, XDG_STATE_HOME and HOME is set; set KEST_DEVICE");
}

TEST(Folder, HasOneNameHoweverItIsWritten) {
    const TemporaryFolder there;
    std::filesystem::create_directory(there.path() / "real");
    std::filesystem::create_directory_symlink(there.path() / "real", there.path() / "link");
    for (const char* name : {"real", "real/", "./real", "link", "link/../real"})
        EXPECT_EQ(Folder(there.path() / name).root(), there.path() / "real") << name;
    EXPECT_TRUE(Folder("relative").root().is_absolute());
}

TEST(Folder, RefusesWhatMarkupCannotCarry) {
    const char* const reason = "\" holds a blank or another character that markup cannot carry (control characters and "
                               "<>&\"'); choose another folder with KEST_DEVICE";
    EXPECT_EQ(messageOf([] { Folder("/my device"); }), "the device's folder \"/my device" + std::string(reason));
    EXPECT_EQ(messageOf([] { Folder("/a\nb"); }), "the device's folder \"/a?b" + std::string(reason));
    for (const char* path : {"/a\tb", "/a<b", "/a>b", "/a&b", "/a\"b", "/a'b", "/a\x7f"})
        EXPECT_THROW(Folder{path}, device::Error) << path;
    EXPECT_EQ(messageOf([] { Folder("/a\xff"); }),
              "the device's folder \"/a?\" is not UTF-8; choose another folder with KEST_DEVICE");
    EXPECT_NO_THROW(Folder("/기기/größe-1.0_x%"));
}

TEST(Folder, IsMadeWithItsParentsForItsUserOnly) {
    const TemporaryFolder there;
    const Folder folder(there.path() / "a/b/device");
    folder.create();
    folder.create();
    struct stat status {};
    ASSERT_EQ(stat(folder.root().c_str(), &status), 0);
    EXPECT_EQ(status.st_mode & 07777, 0700U);
}

TEST(Folder, SaysThatAFileStandsInItsPlace) {
    const TemporaryFolder there;
    writeFile(there.path() / "device", "");
    EXPECT_EQ(messageOf([&] { Folder(there.path() / "device").create(); }),
              there.path().string() + "/device: the device's folder cannot be made: a file stands in its place; give "
                                      "the device another folder with KEST_DEVICE, or make this one writable");
    EXPECT_EQ(messageOf([&] { Folder(there.path() / "device/below").create(); }),
              there.path().string() + "/device/below: the device's folder cannot be made: Not a directory; give the "
                                      "device another folder with KEST_DEVICE, or make this one writable");
}

TEST(Folder, SaysThatItCannotBeWritten) {
    const TemporaryFolder there;
    std::filesystem::create_directory(there.path() / "device");
    auto other = Process::ofWork([&] {
        std::filesystem::permissions(there.path() / "device", std::filesystem::perms(0555));
        if (!support::obeyPermissions())
            return 2;
        const std::string expected = there.path().string() +
                                     "/device: the device's folder cannot be written: Permission denied; give the "
                                     "device another folder with KEST_DEVICE, or make this one writable";
        return messageOf([&] { Folder(there.path() / "device").create(); }) == expected ? 0 : 1;
    });
    EXPECT_EQ(other.wait(), 0);
}

}  // namespace
