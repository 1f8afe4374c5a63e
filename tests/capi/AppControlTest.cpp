#include "app_control.h"

#include "Owned.h"

#include <gmock/gmock.h>
#include <gtest/gtest.h>

#include <vector>

namespace {

using testing::ElementsAre;

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

}  // namespace
