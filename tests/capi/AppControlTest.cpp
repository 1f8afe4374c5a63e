#include "app_control.h"

#include "Owned.h"
#include "support/TemporaryDevice.h"

#include <gmock/gmock.h>
#include <gtest/gtest.h>

#include <sys/wait.h>
#include <vector>

namespace {

using testing::ElementsAre;
using testing::IsEmpty;
using testing::Pair;

class AppControl : public testing::Test {
protected:
    AppControl() { EXPECT_EQ(app_control_create(&request), APP_CONTROL_ERROR_NONE); }
    ~AppControl() override { app_control_destroy(request); }

    std::optional<std::string> extra(const char* key) const {
        char* value = nullptr;
        EXPECT_EQ(app_control_get_extra_data(request, key, &value), APP_CONTROL_ERROR_NONE);
        return owned(value);
    }

    app_control_h request = nullptr;
};

TEST_F(AppControl, CarriesAnApplicationId) {
    char* id = nullptr;
    EXPECT_EQ(app_control_get_app_id(request, &id), APP_CONTROL_ERROR_KEY_NOT_FOUND);
    EXPECT_EQ(app_control_set_app_id(request, "com.example.tea"), APP_CONTROL_ERROR_NONE);
    EXPECT_EQ(app_control_get_app_id(request, &id), APP_CONTROL_ERROR_NONE);
    EXPECT_EQ(owned(id), "com.example.tea");
}

TEST_F(AppControl, CarriesExtras) {
    EXPECT_EQ(app_control_add_extra_data(request, "key", "first"), APP_CONTROL_ERROR_NONE);
    EXPECT_EQ(app_control_add_extra_data(request, "key", "second"), APP_CONTROL_ERROR_NONE);
    EXPECT_EQ(app_control_add_extra_data(request, "empty", ""), APP_CONTROL_ERROR_NONE);
    EXPECT_EQ(extra("key"), "second");
    EXPECT_EQ(extra("empty"), "");
    char* value = nullptr;
    EXPECT_EQ(app_control_get_extra_data(request, "none", &value), APP_CONTROL_ERROR_KEY_NOT_FOUND);
    EXPECT_EQ(value, nullptr);
}

struct Visit {
    std::vector<std::string> keys;
    std::size_t most;
};

bool visit(app_control_h, const char* key, void* data) {
    auto* all = static_cast<Visit*>(data);
    all->keys.emplace_back(key);
    return all->keys.size() < all->most;
}

TEST_F(AppControl, VisitsItsExtrasInTheOrderOfTheirKeysUntilTheVisitorHasEnough) {
    for (const char* key : {"c", "a", "b"})
        app_control_add_extra_data(request, key, "value");
    Visit all{{}, 9};
    EXPECT_EQ(app_control_foreach_extra_data(request, visit, &all), APP_CONTROL_ERROR_NONE);
    EXPECT_THAT(all.keys, ElementsAre("a", "b", "c"));
    Visit two{{}, 2};
    EXPECT_EQ(app_control_foreach_extra_data(request, visit, &two), APP_CONTROL_ERROR_NONE);
    EXPECT_THAT(two.keys, ElementsAre("a", "b"));
}

TEST_F(AppControl, RefusesNullAndEmptyKeys) {
    char* value = nullptr;
    EXPECT_EQ(app_control_create(nullptr), APP_CONTROL_ERROR_INVALID_PARAMETER);
    EXPECT_EQ(app_control_destroy(nullptr), APP_CONTROL_ERROR_INVALID_PARAMETER);
    EXPECT_EQ(app_control_set_app_id(nullptr, "id"), APP_CONTROL_ERROR_INVALID_PARAMETER);
    EXPECT_EQ(app_control_set_app_id(request, nullptr), APP_CONTROL_ERROR_INVALID_PARAMETER);
    EXPECT_EQ(app_control_get_app_id(nullptr, &value), APP_CONTROL_ERROR_INVALID_PARAMETER);
    EXPECT_EQ(app_control_get_app_id(request, nullptr), APP_CONTROL_ERROR_INVALID_PARAMETER);
    EXPECT_EQ(app_control_add_extra_data(nullptr, "key", "value"), APP_CONTROL_ERROR_INVALID_PARAMETER);
    EXPECT_EQ(app_control_add_extra_data(request, nullptr, "value"), APP_CONTROL_ERROR_INVALID_PARAMETER);
    EXPECT_EQ(app_control_add_extra_data(request, "", "value"), APP_CONTROL_ERROR_INVALID_PARAMETER);
    EXPECT_EQ(app_control_add_extra_data(request, "key", nullptr), APP_CONTROL_ERROR_INVALID_PARAMETER);
    EXPECT_EQ(app_control_get_extra_data(nullptr, "key", &value), APP_CONTROL_ERROR_INVALID_PARAMETER);
    EXPECT_EQ(app_control_get_extra_data(request, nullptr, &value), APP_CONTROL_ERROR_INVALID_PARAMETER);
    EXPECT_EQ(app_control_get_extra_data(request, "", &value), APP_CONTROL_ERROR_INVALID_PARAMETER);
    EXPECT_EQ(app_control_get_extra_data(request, "key", nullptr), APP_CONTROL_ERROR_INVALID_PARAMETER);
    EXPECT_EQ(app_control_foreach_extra_data(nullptr, visit, nullptr), APP_CONTROL_ERROR_INVALID_PARAMETER);
    EXPECT_EQ(app_control_foreach_extra_data(request, nullptr, nullptr), APP_CONTROL_ERROR_INVALID_PARAMETER);
}

class LaunchRequest : public AppControl {
protected:
    LaunchRequest() {
        device_.addPackage("com.example.tea");
        app_control_set_app_id(request, "com.example.tea");
    }
    void setProgram(const std::string& script) const {
        const auto program = device_.preinstalled() / "com.example.tea/bin/app";
        support::writeFile(program, "#!/bin/sh\n" + script);
        std::filesystem::permissions(program, std::filesystem::perms::owner_all);
    }
    int send() const { return app_control_send_launch_request(request, nullptr, nullptr); }

    support::TemporaryDevice device_;
};

TEST_F(LaunchRequest, StartsTheApplicationWithTheExtras) {
    setProgram("echo \"$@\"\n");
    app_control_add_extra_data(request, "page", "walk");
    app_control_add_extra_data(request, "cup", "2");
    EXPECT_EQ(send(), APP_CONTROL_ERROR_NONE);
    waitpid(-1, nullptr, 0);
    EXPECT_EQ(support::readFile(device_->folder().output("com.example.tea")), "cup=2 page=walk\n");
    const auto records = device_->launches().all();
    ASSERT_EQ(records.size(), 1U);
    EXPECT_EQ(records[0].request.caller, "com.example.app");
    EXPECT_EQ(records[0].request.appId, "com.example.tea");
    EXPECT_THAT(records[0].request.extras, ElementsAre(Pair("cup", "2"), Pair("page", "walk")));
    EXPECT_EQ(records[0].outcome, device::LaunchOutcome::Started);
}

TEST_F(LaunchRequest, NeedsAnInstalledApplication) {
    app_control_set_app_id(request, "com.example.none");
    EXPECT_EQ(send(), APP_CONTROL_ERROR_APP_NOT_FOUND);
    app_control_set_app_id(request, "");
    EXPECT_EQ(send(), APP_CONTROL_ERROR_APP_NOT_FOUND);
    support::writeFile(device_.preinstalled() / "com.example.bare/tizen-manifest.xml",
                       "<manifest package='com.example.bare'/>");
    app_control_set_app_id(request, "com.example.bare");
    EXPECT_EQ(send(), APP_CONTROL_ERROR_APP_NOT_FOUND);
    EXPECT_EQ(device_->launches().all().size(), 3U);
}

TEST_F(LaunchRequest, NeedsAProgramThatCanRun) {
    EXPECT_EQ(send(), APP_CONTROL_ERROR_LAUNCH_FAILED);
    support::writeFile(device_.preinstalled() / "com.example.tea/tizen-manifest.xml", "<manifest");
    EXPECT_EQ(send(), APP_CONTROL_ERROR_LAUNCH_FAILED);
}

TEST_F(LaunchRequest, NeedsExtrasThatCanBePassedOn) {
    setProgram("");
    app_control_add_extra_data(request, "text", "caf\xe9");
    EXPECT_EQ(send(), APP_CONTROL_ERROR_LAUNCH_REJECTED);
}

TEST_F(LaunchRequest, RefusesNullAndACallback) {
    EXPECT_EQ(app_control_send_launch_request(nullptr, nullptr, nullptr), APP_CONTROL_ERROR_INVALID_PARAMETER);
    const auto callback = [](app_control_h, app_control_h, app_control_result_e, void*) {};
    EXPECT_EQ(app_control_send_launch_request(request, callback, nullptr), APP_CONTROL_ERROR_NOT_SUPPORTED);
    EXPECT_THAT(device_->launches().all(), IsEmpty());
}

}  // namespace
