#include "app_preference.h"

#include "Owned.h"
#include "support/TemporaryDevice.h"

#include <gtest/gtest.h>

namespace {

using support::TemporaryDevice;

std::optional<std::string> preference(const char* key) {
    char* value = nullptr;
    EXPECT_EQ(preference_get_string(key, &value), PREFERENCE_ERROR_NONE);
    return owned(value);
}

TEST(AppPreference, GivesBackWhatWasSet) {
    TemporaryDevice device;
    ASSERT_EQ(preference_set_string("key", "first"), PREFERENCE_ERROR_NONE);
    ASSERT_EQ(preference_set_string("key", "second"), PREFERENCE_ERROR_NONE);
    device.reopen();
    EXPECT_EQ(preference("key"), "second");
}

TEST(AppPreference, KeepsEveryByte) {
    const TemporaryDevice device;
    const std::string large(1024 * 1024, 'x');
    for (const char* text : {"", "it's \"quoted\"; DROP TABLE preference; --", "\xff\xfe", "\n\t", large.c_str()}) {
        ASSERT_EQ(preference_set_string(text, text), PREFERENCE_ERROR_NONE);
        EXPECT_EQ(preference(text), text);
    }
}

TEST(AppPreference, BelongsToTheApplicationOfTheProcess) {
    const TemporaryDevice device("com.example.one");
    preference_set_string("key", "value");
    EXPECT_EQ(device->preferences().get("com.example.one", "key"), "value");
    device->setApplication({"com.example.two", device.appRoot()});
    char* value = nullptr;
    EXPECT_EQ(preference_get_string("key", &value), PREFERENCE_ERROR_NO_KEY);
    EXPECT_EQ(value, nullptr);
}

TEST(AppPreference, RemovesOnlyTheApplicationsOwn) {
    const TemporaryDevice device("com.example.one");
    preference_set_string("key", "value");
    device->preferences().set("com.example.two", "key", "other");
    EXPECT_EQ(preference_remove_all(), PREFERENCE_ERROR_NONE);
    char* value = nullptr;
    EXPECT_EQ(preference_get_string("key", &value), PREFERENCE_ERROR_NO_KEY);
    EXPECT_EQ(device->preferences().get("com.example.two", "key"), "other");
}

TEST(AppPreference, RefusesNull) {
    const TemporaryDevice device;
    char* value = nullptr;
    EXPECT_EQ(preference_set_string(nullptr, "value"), PREFERENCE_ERROR_INVALID_PARAMETER);
    EXPECT_EQ(preference_set_string("key", nullptr), PREFERENCE_ERROR_INVALID_PARAMETER);
    EXPECT_EQ(preference_get_string(nullptr, &value), PREFERENCE_ERROR_INVALID_PARAMETER);
    EXPECT_EQ(preference_get_string("key", nullptr), PREFERENCE_ERROR_INVALID_PARAMETER);
}

}  // namespace
