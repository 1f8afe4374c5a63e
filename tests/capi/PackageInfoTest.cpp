#include "package_info.h"

#include "Owned.h"
#include "device/Device.h"
#include "device/Keys.h"
#include "package_manager.h"
#include "support/TemporaryDevice.h"

#include <gtest/gtest.h>

namespace {

using support::TemporaryDevice;
using support::writeFile;

TEST(PackageInfo, KnowsVersionAndIcon) {
    const TemporaryDevice device("com.example.tea", "2.1");
    for (const auto lookUp : {&package_info_create, &package_manager_get_package_info}) {
        package_info_h info = nullptr;
        ASSERT_EQ(lookUp("com.example.tea", &info), PACKAGE_MANAGER_ERROR_NONE);
        char* version = nullptr;
        char* icon = nullptr;
        EXPECT_EQ(package_info_get_version(info, &version), PACKAGE_MANAGER_ERROR_NONE);
        EXPECT_EQ(package_info_get_icon(info, &icon), PACKAGE_MANAGER_ERROR_NONE);
        char* label = nullptr;
        EXPECT_EQ(package_info_get_label(info, &label), PACKAGE_MANAGER_ERROR_NONE);
        EXPECT_EQ(owned(label), "Label of " + device.appId());
        EXPECT_EQ(owned(version), "2.1");
        EXPECT_EQ(owned(icon), device.appRoot().string() + "/shared/res/icon.png");
        EXPECT_EQ(package_info_destroy(info), PACKAGE_MANAGER_ERROR_NONE);
    }
}

TEST(PackageInfo, MayLackVersionAndIcon) {
    const TemporaryDevice device;
    writeFile(device.preinstalled() / "com.example.bare/tizen-manifest.xml", "<manifest package='com.example.bare'/>");
    package_info_h info = nullptr;
    ASSERT_EQ(package_info_create("com.example.bare", &info), PACKAGE_MANAGER_ERROR_NONE);
    char* version = nullptr;
    char unset = 0;
    char* icon = &unset;
    EXPECT_EQ(package_info_get_version(info, &version), PACKAGE_MANAGER_ERROR_NONE);
    EXPECT_EQ(owned(version), "");
    EXPECT_EQ(package_info_get_icon(info, &icon), PACKAGE_MANAGER_ERROR_NONE);
    EXPECT_EQ(icon, nullptr);
    char* label = nullptr;
    EXPECT_EQ(package_info_get_label(info, &label), PACKAGE_MANAGER_ERROR_NONE);
    EXPECT_EQ(owned(label), "com.example.bare");
    package_info_destroy(info);
}

TEST(PackageInfo, NamesTheApplicationInTheDisplayLanguage) {
    const TemporaryDevice device;
    writeFile(device.preinstalled() / "com.example.tea/tizen-manifest.xml",
              "<manifest package='com.example.tea'><ui-application appid='com.example.tea'><label>Tea</label>"
              "<label xml:lang='ko-kr'>차</label></ui-application></manifest>");
    package_info_h info = nullptr;
    ASSERT_EQ(package_info_create("com.example.tea", &info), PACKAGE_MANAGER_ERROR_NONE);
    for (const auto& [language, name] : {std::pair("en_US", "Tea"), std::pair("ko_KR", "차")}) {
        device::Device::current().settings().set(device::keys::language, std::string(language) + ".UTF-8");
        char* label = nullptr;
        EXPECT_EQ(package_info_get_label(info, &label), PACKAGE_MANAGER_ERROR_NONE);
        EXPECT_EQ(owned(label), name);
    }
    package_info_destroy(info);
}

TEST(PackageInfo, IsNoneForWhatIsNotInstalled) {
    const TemporaryDevice device;
    for (const char* id : {"com.example.none", "", "../x"}) {
        char unset = 0;
        auto info = reinterpret_cast<package_info_h>(&unset);
        EXPECT_EQ(package_info_create(id, &info), PACKAGE_MANAGER_ERROR_NO_SUCH_PACKAGE) << id;
        EXPECT_EQ(info, nullptr);
    }
}

TEST(PackageInfo, IsAnErrorForABrokenManifest) {
    const TemporaryDevice device;
    writeFile(device.preinstalled() / "com.example.broken/tizen-manifest.xml", "<manifest");
    package_info_h info = nullptr;
    EXPECT_EQ(package_manager_get_package_info("com.example.broken", &info), PACKAGE_MANAGER_ERROR_IO_ERROR);
    EXPECT_EQ(info, nullptr);
}

TEST(PackageInfo, RefusesNull) {
    const TemporaryDevice device;
    package_info_h info = nullptr;
    char* text = nullptr;
    EXPECT_EQ(package_info_create(nullptr, &info), PACKAGE_MANAGER_ERROR_INVALID_PARAMETER);
    EXPECT_EQ(package_info_create("com.example.app", nullptr), PACKAGE_MANAGER_ERROR_INVALID_PARAMETER);
    EXPECT_EQ(package_info_get_version(nullptr, &text), PACKAGE_MANAGER_ERROR_INVALID_PARAMETER);
    EXPECT_EQ(package_info_get_icon(nullptr, &text), PACKAGE_MANAGER_ERROR_INVALID_PARAMETER);
    EXPECT_EQ(package_info_get_label(nullptr, &text), PACKAGE_MANAGER_ERROR_INVALID_PARAMETER);
    EXPECT_EQ(package_info_destroy(nullptr), PACKAGE_MANAGER_ERROR_INVALID_PARAMETER);
    ASSERT_EQ(package_info_create("com.example.app", &info), PACKAGE_MANAGER_ERROR_NONE);
    EXPECT_EQ(package_info_get_version(info, nullptr), PACKAGE_MANAGER_ERROR_INVALID_PARAMETER);
    EXPECT_EQ(package_info_get_icon(info, nullptr), PACKAGE_MANAGER_ERROR_INVALID_PARAMETER);
    EXPECT_EQ(package_info_get_label(info, nullptr), PACKAGE_MANAGER_ERROR_INVALID_PARAMETER);
    package_info_destroy(info);
}

}  // namespace
