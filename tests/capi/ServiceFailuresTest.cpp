#include "app_preference.h"
#include "package_info.h"
#include "ravella-log-client.h"
#include "support/Environment.h"
#include "support/TemporaryDevice.h"
#include "vconf.h"

#include <gmock/gmock.h>
#include <gtest/gtest.h>

#include <cerrno>

namespace {

using support::TemporaryDevice;
using testing::ElementsAre;
using testing::IsEmpty;

TEST(ServiceFailures, OfAFullDiskAreACodeAndOneLineInTheLogAndOnStandardError) {
    const TemporaryDevice device;
    device->database().sql().exec("PRAGMA max_page_count = 20");
    testing::internal::CaptureStderr();
    const std::string large(1 << 20, 'x');
    for (int attempt = 0; attempt < 3; ++attempt) {
        EXPECT_EQ(preference_set_string("key", large.c_str()), PREFERENCE_ERROR_IO_ERROR);
        EXPECT_EQ(vconf_set_str("key", large.c_str()), -1);
    }
    EXPECT_THAT(device.logMessages(),
                ElementsAre("E DEVICE " + device.root().string() +
                            "/device.db: the disk is full (database or disk is full); free some space and try again"));
    EXPECT_EQ(vconf_set_str("key", "small"), 0);
    EXPECT_EQ(testing::internal::GetCapturedStderr(),
              std::string(program_invocation_short_name) + ": error: " + device.root().string() +
                  "/device.db: the disk is full (database or disk is full); free some space and try again\n");
}

TEST(ServiceFailures, OfADamagedPageAreACodeAndOneLineInTheLog) {
    TemporaryDevice device;
    for (int number = 0; number < 50; ++number)
        preference_set_string(std::to_string(number).c_str(), std::string(2000, 'x').c_str());
    device::Device::setCurrent(nullptr);
    const auto file = device.root() / "device.db";
    std::string bytes = support::readFile(file);
    bytes.replace(4096, bytes.size() - 4096, bytes.size() - 4096, '\xee');
    support::writeFile(file, bytes);
    device.reopen();

    char* value = nullptr;
    EXPECT_EQ(preference_get_string("7", &value), PREFERENCE_ERROR_IO_ERROR);
    EXPECT_EQ(preference_get_string("8", &value), PREFERENCE_ERROR_IO_ERROR);
    EXPECT_EQ(vconf_get_str("db/setting/theme"), nullptr);
    EXPECT_THAT(device.logMessages(), ElementsAre("E DEVICE " + file.string() +
                                                  ": is damaged (database disk image is malformed); start the device "
                                                  "anew, which sets the file aside"));
}

TEST(ServiceFailures, OfTwoKindsAreTwoLines) {
    const TemporaryDevice device;
    device.addPackage("com.example.broken");
    support::writeFile(device.preinstalled() / "com.example.broken/tizen-manifest.xml", "");
    package_info_h info = nullptr;
    EXPECT_EQ(package_info_create("com.example.broken", &info), PACKAGE_MANAGER_ERROR_IO_ERROR);
    device->database().sql().exec("DROP TABLE preference");
    EXPECT_EQ(preference_set_string("key", "value"), PREFERENCE_ERROR_IO_ERROR);
    EXPECT_THAT(
        device.logMessages(),
        ElementsAre("E DEVICE " + (device.preinstalled() / "com.example.broken/tizen-manifest.xml").string() +
                        ":1: is not well-formed XML: Document is empty",
                    "E DEVICE " + device.root().string() + "/device.db: cannot be used (no such table: preference)"));
}

TEST(ServiceFailures, WithoutADeviceAreACodeAndOneLineOnStandardError) {
    const support::TemporaryFolder there;
    support::writeFile(there.path() / "file", "");
    const support::Environment named("KEST_DEVICE", (there.path() / "file").string());
    device::Device::setCurrent(nullptr);
    testing::internal::CaptureStderr();
    EXPECT_EQ(preference_set_string("key", "value"), PREFERENCE_ERROR_IO_ERROR);
    EXPECT_EQ(vconf_get_str("key"), nullptr);
    ravella_log_manager_h manager = nullptr;
    EXPECT_EQ(ravella_log_manager_create(&manager), TIZEN_ERROR_IO_ERROR);
    EXPECT_EQ(testing::internal::GetCapturedStderr(),
              std::string(program_invocation_short_name) + ": error: " + (there.path() / "file").string() +
                  ": the device's folder cannot be made: a file stands in its place; give the device another folder "
                  "with KEST_DEVICE, or make this one writable\n");
}

TEST(ServiceFailures, AreNoneWhereThereIsNoBusAndNoMainLoop) {
    const TemporaryDevice device;
    const support::Environment bus("DBUS_SESSION_BUS_ADDRESS", "unix:path=/nowhere");
    testing::internal::CaptureStderr();
    EXPECT_EQ(vconf_set_str("key", "value"), 0);
    EXPECT_EQ(preference_set_string("key", "value"), PREFERENCE_ERROR_NONE);
    EXPECT_EQ(testing::internal::GetCapturedStderr(), "");
    EXPECT_THAT(device.logMessages(), IsEmpty());
}

}  // namespace
