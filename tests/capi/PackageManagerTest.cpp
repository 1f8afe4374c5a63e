#include "package_manager.h"

#include "device/Error.h"
#include "support/TemporaryDevice.h"

#include <gmock/gmock.h>
#include <gtest/gtest.h>

namespace {

using support::TemporaryDevice;
using testing::ElementsAre;
using testing::IsEmpty;

using Lines = std::vector<std::string>;

void note(const char* type, const char* package, package_manager_event_type_e eventType,
          package_manager_event_state_e state, int progress, package_manager_error_e error, void* lines) {
    const char* const types[] = {"install", "uninstall", "update"};
    const char* const states[] = {"started", "processing", "completed", "failed"};
    static_cast<Lines*>(lines)->push_back(std::string(type) + " " + package + " " + types[eventType] + " " +
                                          states[state] + " " + std::to_string(progress) + " " + std::to_string(error));
}

class PackageManager : public testing::Test {
protected:
    PackageManager() { EXPECT_EQ(package_manager_create(&manager), PACKAGE_MANAGER_ERROR_NONE); }
    ~PackageManager() override { package_manager_destroy(manager); }

    std::filesystem::path tea(const std::string& version = "1.0") const {
        return TemporaryDevice::makePackage(device.folder() / version, "com.example.tea", version);
    }

    TemporaryDevice device;
    package_manager_h manager = nullptr;
    Lines lines;
};

TEST_F(PackageManager, TellsOfInstallationsUpdatesAndRemovals) {
    ASSERT_EQ(package_manager_set_event_cb(manager, note, &lines), PACKAGE_MANAGER_ERROR_NONE);
    device->packages().install(tea());
    device->packages().install(tea("2.0"));
    device->packages().uninstall("com.example.tea");
    EXPECT_THAT(
        lines, ElementsAre("tpk com.example.tea install started 0 0", "tpk com.example.tea install processing 50 0",
                           "tpk com.example.tea install completed 100 0", "tpk com.example.tea update started 0 0",
                           "tpk com.example.tea update processing 50 0", "tpk com.example.tea update completed 100 0",
                           "tpk com.example.tea uninstall started 0 0", "tpk com.example.tea uninstall processing 50 0",
                           "tpk com.example.tea uninstall completed 100 0"));
}

TEST_F(PackageManager, TellsOfAFailureWithItsCode) {
    ASSERT_EQ(package_manager_set_event_cb(manager, note, &lines), PACKAGE_MANAGER_ERROR_NONE);
    const auto bad = tea();
    std::filesystem::create_symlink("/", bad / "link");
    EXPECT_THROW(device->packages().install(bad), device::Error);
    EXPECT_THAT(lines,
                ElementsAre("tpk com.example.tea install started 0 0",
                            "tpk com.example.tea install failed 0 " + std::to_string(PACKAGE_MANAGER_ERROR_IO_ERROR)));
}

TEST_F(PackageManager, TellsNothingAfterItsCallbackIsUnset) {
    ASSERT_EQ(package_manager_set_event_cb(manager, note, &lines), PACKAGE_MANAGER_ERROR_NONE);
    EXPECT_EQ(package_manager_unset_event_cb(manager), PACKAGE_MANAGER_ERROR_NONE);
    EXPECT_EQ(package_manager_unset_event_cb(manager), PACKAGE_MANAGER_ERROR_NONE);
    device->packages().install(tea());
    EXPECT_THAT(lines, IsEmpty());
}

TEST_F(PackageManager, HasOneCallbackAtATime) {
    Lines first;
    ASSERT_EQ(package_manager_set_event_cb(manager, note, &first), PACKAGE_MANAGER_ERROR_NONE);
    ASSERT_EQ(package_manager_set_event_cb(manager, note, &lines), PACKAGE_MANAGER_ERROR_NONE);
    device->packages().install(tea());
    EXPECT_THAT(first, IsEmpty());
    EXPECT_EQ(lines.size(), 3U);
}

/// A view that goes at the first event.
struct Leaving {
    package_manager_h manager;
    int calls;
};

TEST_F(PackageManager, MayBeDestroyedInsideItsCallback) {
    Leaving leaving{manager, 0};
    ASSERT_EQ(package_manager_set_event_cb(
                  manager,
                  [](const char*, const char* package, package_manager_event_type_e, package_manager_event_state_e, int,
                     package_manager_error_e, void* data) {
                      auto* view = static_cast<Leaving*>(data);
                      ++view->calls;
                      EXPECT_EQ(package_manager_destroy(view->manager), PACKAGE_MANAGER_ERROR_NONE);
                      EXPECT_STREQ(package, "com.example.tea");
                  },
                  &leaving),
              PACKAGE_MANAGER_ERROR_NONE);
    device->packages().install(tea());
    EXPECT_EQ(leaving.calls, 1);
    manager = nullptr;
}

TEST_F(PackageManager, OutlivesADeviceThatIsReplaced) {
    ASSERT_EQ(package_manager_set_event_cb(manager, note, &lines), PACKAGE_MANAGER_ERROR_NONE);
    device.reopen();
    device->packages().install(tea());
    EXPECT_THAT(lines, IsEmpty());
}

TEST_F(PackageManager, RefusesNull) {
    EXPECT_EQ(package_manager_create(nullptr), PACKAGE_MANAGER_ERROR_INVALID_PARAMETER);
    EXPECT_EQ(package_manager_destroy(nullptr), PACKAGE_MANAGER_ERROR_INVALID_PARAMETER);
    EXPECT_EQ(package_manager_set_event_cb(nullptr, note, &lines), PACKAGE_MANAGER_ERROR_INVALID_PARAMETER);
    EXPECT_EQ(package_manager_set_event_cb(manager, nullptr, &lines), PACKAGE_MANAGER_ERROR_INVALID_PARAMETER);
    EXPECT_EQ(package_manager_unset_event_cb(nullptr), PACKAGE_MANAGER_ERROR_INVALID_PARAMETER);
}

}  // namespace
