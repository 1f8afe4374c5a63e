#include "ShellTest.h"

#include "KestCommon.h"
#include "KestPaths.h"

#include <app_common.h>
#include <app_manager.h>
#include <device/Keys.h>

using testing::ElementsAre;

/// Paths that the shell tells the views.
class ThemeFile : public ShellTest {
protected:
    kest_log::Line info(const std::string& path) const {
        return kest_log::info("KestCommon.cpp", "getEdjFilePath", "edje resource path[" + path + "]");
    }
};

TEST_F(ThemeFile, IsResolvedByTheResourceManager) {
    EXPECT_EQ(KestCommon::getEdjFilePath(true), resource("edje/kest.edj"));
    EXPECT_THAT(calls::madeOf({"app_resource_manager_get"}), ElementsAre("app_resource_manager_get 0 edje/kest.edj"));
    EXPECT_THAT(newLog(), ElementsAre(info(resource("edje/kest.edj"))));
}

TEST_F(ThemeFile, IsThatOfTheDisplaysDensity) {
    support::writeFile(resource("LDPI/edje/kest.edj"), "");
    device()->settings().set(device::keys::screen, "480x800");
    EXPECT_EQ(KestCommon::getEdjFilePath(true), resource("LDPI/edje/kest.edj"));
    EXPECT_EQ(KestCommon::getEdjFilePath(false), resource("edje/kest.edj"));
}

TEST_F(ThemeFile, LiesInTheResourceFolder) {
    EXPECT_EQ(KestCommon::getEdjFilePath(false), resource("edje/kest.edj"));
    EXPECT_THAT(calls::madeOf({"app_resource_manager_get"}), testing::IsEmpty());
    EXPECT_THAT(newLog(), ElementsAre(info(resource("edje/kest.edj"))));
}

TEST_F(ThemeFile, IsEmptyWhenTheResourceManagerFails) {
    calls::fail("app_resource_manager_get");
    EXPECT_EQ(KestCommon::getEdjFilePath(true), "");
    EXPECT_THAT(newLog(), ElementsAre(info("")));
}

TEST_F(ThemeFile, IsEmptyWhenTheResourceFolderIsUnknown) {
    device::faults::plan("app_get_resource_path", -1);
    EXPECT_EQ(KestCommon::getEdjFilePath(false), "");
    EXPECT_THAT(newLog(), ElementsAre(info("")));
}

TEST_F(ThemeFile, IsEmptyWhenItIsNotThere) {
    std::filesystem::remove(resource("edje/kest.edj"));
    EXPECT_EQ(KestCommon::getEdjFilePath(true), "");
}

using SharedResources = ThemeFile;

TEST_F(SharedResources, AreThoseOfTheApplication) {
    addApplication("com.example.clock");
    EXPECT_EQ(KestCommon::getSharedResourcePath("com.example.clock"), resources("com.example.clock").string() + "/");
}

TEST_F(SharedResources, AreTheFixedOnesOfAnApplicationThatIsNotThere) {
    EXPECT_EQ(KestCommon::getSharedResourcePath("com.example.gone"), KEST_APP_ROOT "/shared/res/");
    EXPECT_EQ(KestCommon::getSharedResourcePath(""), KEST_APP_ROOT "/shared/res/");
}

TEST_F(SharedResources, AreTheFixedOnesWhenThePlatformFails) {
    device::faults::plan("app_manager_get_shared_resource_path", APP_MANAGER_ERROR_IO_ERROR);
    EXPECT_EQ(KestCommon::getSharedResourcePath(kest), KEST_APP_ROOT "/shared/res/");
}
