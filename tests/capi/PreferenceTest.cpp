#include "app_preference.h"
#include "support/TemporaryDevice.h"

#include <gtest/gtest.h>

TEST(Preference, GivesBackWhatWasSet) {
    const support::TemporaryDevice device;
    ASSERT_EQ(preference_set_string("key", "value"), PREFERENCE_ERROR_NONE);
    char* value = nullptr;
    ASSERT_EQ(preference_get_string("key", &value), PREFERENCE_ERROR_NONE);
    EXPECT_STREQ(value, "value");
    std::free(value);
}
