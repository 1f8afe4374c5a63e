#include "app_common.h"
#include "app_manager.h"
#include "app_resource_manager.h"

#include "Owned.h"
#include "device/Keys.h"
#include "support/TemporaryDevice.h"

#include <gtest/gtest.h>

namespace {

using support::TemporaryDevice;
using support::writeFile;

TEST(AppCommon, KnowsTheApplicationOfTheProcess) {
    const TemporaryDevice device("com.example.tea");
    char* id = nullptr;
    EXPECT_EQ(app_get_id(&id), 0);
    EXPECT_EQ(owned(id), "com.example.tea");
    EXPECT_EQ(owned(app_get_resource_path()), device.appRoot().string() + "/res/");
    EXPECT_EQ(app_get_id(nullptr), TIZEN_ERROR_INVALID_PARAMETER);
}

TEST(AppCommon, NumbersTheEventsAsTheDeviceDoes) {
    EXPECT_EQ(static_cast<int>(APP_EVENT_LOW_MEMORY), 0);
    EXPECT_EQ(static_cast<int>(APP_EVENT_LOW_BATTERY), 1);
    EXPECT_EQ(static_cast<int>(APP_EVENT_LANGUAGE_CHANGED), 2);
    EXPECT_EQ(static_cast<int>(APP_EVENT_DEVICE_ORIENTATION_CHANGED), 3);
    EXPECT_EQ(static_cast<int>(APP_EVENT_REGION_FORMAT_CHANGED), 4);
}

std::optional<std::string> sharedPath(const char* id) {
    char* path = nullptr;
    EXPECT_EQ(app_manager_get_shared_resource_path(id, &path), APP_MANAGER_ERROR_NONE);
    return owned(path);
}

TEST(AppManager, KnowsTheSharedResourcesOfEveryInstalledApplication) {
    const TemporaryDevice device;
    EXPECT_EQ(sharedPath("com.example.app"), device.appRoot().string() + "/shared/res/");
    device->packages().install(TemporaryDevice::makePackage(device.folder() / "tea", "com.example.tea"));
    EXPECT_EQ(sharedPath("com.example.tea"), device.root().string() + "/opt/usr/apps/com.example.tea/shared/res/");
}

TEST(AppManager, KnowsNoApplicationThatIsNotInstalled) {
    const TemporaryDevice device;
    device->packages().uninstall("com.example.app");
    for (const char* id : {"com.example.app", "com.example.none", "", "..", "../apps"}) {
        char* path = nullptr;
        EXPECT_EQ(app_manager_get_shared_resource_path(id, &path), APP_MANAGER_ERROR_NO_SUCH_APP) << id;
        EXPECT_EQ(path, nullptr);
    }
}

TEST(AppManager, RefusesNull) {
    const TemporaryDevice device;
    char* path = nullptr;
    EXPECT_EQ(app_manager_get_shared_resource_path(nullptr, &path), APP_MANAGER_ERROR_INVALID_PARAMETER);
    EXPECT_EQ(app_manager_get_shared_resource_path("com.example.app", nullptr), APP_MANAGER_ERROR_INVALID_PARAMETER);
}

class AppResourceManager : public testing::Test {
protected:
    std::optional<std::string> resource(const char* id) const {
        char* path = nullptr;
        EXPECT_EQ(app_resource_manager_get(APP_RESOURCE_TYPE_IMAGE, id, &path), APP_RESOURCE_ERROR_NONE) << id;
        return owned(path);
    }

    TemporaryDevice device;
    std::string resources = (device.appRoot() / "res/").string();
};

TEST_F(AppResourceManager, FindsAFileBelowTheResources) {
    writeFile(resources + "edje/app.edj", "");
    writeFile(resources + "LDPI/edje/app.edj", "");
    EXPECT_EQ(resource("edje/app.edj"), resources + "edje/app.edj");
}

TEST_F(AppResourceManager, PrefersTheLowDensityFileOnALowDensityDisplay) {
    device->settings().set(device::keys::screen, "480x800");
    writeFile(resources + "images/both.png", "");
    writeFile(resources + "LDPI/images/both.png", "");
    writeFile(resources + "images/one.png", "");
    writeFile(resources + "LDPI/images/low.png", "");
    EXPECT_EQ(resource("images/both.png"), resources + "LDPI/images/both.png");
    EXPECT_EQ(resource("images/one.png"), resources + "images/one.png");
    EXPECT_EQ(resource("images/low.png"), resources + "LDPI/images/low.png");
}

TEST_F(AppResourceManager, GivesAnExistingFileOfTheApplicationOrNothing) {
    writeFile(device.appRoot() / "secret", "");
    writeFile(resources + "edje/app.edj", "");
    const std::string absolute = resources + "edje/app.edj";
    for (const char* id : {"none.png", "edje", "", "../secret", "edje/../../secret", absolute.c_str()}) {
        char unset = 0;
        char* path = &unset;
        EXPECT_EQ(app_resource_manager_get(APP_RESOURCE_TYPE_LAYOUT, id, &path), APP_RESOURCE_ERROR_IO_ERROR) << id;
        EXPECT_EQ(path, nullptr) << id;
    }
}

TEST_F(AppResourceManager, RefusesNull) {
    char unset = 0;
    char* path = &unset;
    EXPECT_EQ(app_resource_manager_get(APP_RESOURCE_TYPE_IMAGE, nullptr, &path), APP_RESOURCE_ERROR_INVALID_PARAMETER);
    EXPECT_EQ(path, nullptr);
    EXPECT_EQ(app_resource_manager_get(APP_RESOURCE_TYPE_IMAGE, "a", nullptr), APP_RESOURCE_ERROR_INVALID_PARAMETER);
}

}  // namespace
