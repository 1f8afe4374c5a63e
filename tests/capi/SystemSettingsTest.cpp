#include "system_settings.h"

#include "Owned.h"
#include "support/TemporaryDevice.h"
#include "vconf.h"

#include <gtest/gtest.h>

namespace {

using support::TemporaryDevice;

std::optional<std::string> setting(system_settings_key_e key) {
    char* value = nullptr;
    EXPECT_EQ(system_settings_get_value_string(key, &value), SYSTEM_SETTINGS_ERROR_NONE);
    return owned(value);
}

TEST(SystemSettings, GiveTheLanguageWithoutItsCodeset) {
    const TemporaryDevice device;
    EXPECT_EQ(setting(SYSTEM_SETTINGS_KEY_LOCALE_LANGUAGE), "en_US");
    vconf_set_str("db/menu_widget/language", "sr_RS.UTF-8@latin");
    EXPECT_EQ(setting(SYSTEM_SETTINGS_KEY_LOCALE_LANGUAGE), "sr_RS@latin");
    vconf_set_str("db/menu_widget/language", "sr_RS@latin");
    EXPECT_EQ(setting(SYSTEM_SETTINGS_KEY_LOCALE_LANGUAGE), "sr_RS@latin");
}

TEST(SystemSettings, GiveTheCountryOrNothing) {
    const TemporaryDevice device;
    EXPECT_EQ(setting(SYSTEM_SETTINGS_KEY_LOCALE_COUNTRY), "");
    vconf_set_str("db/csc/text_string_country", "IN");
    EXPECT_EQ(setting(SYSTEM_SETTINGS_KEY_LOCALE_COUNTRY), "IN");
}

TEST(SystemSettings, KeepTheNumbersOfTheirInterface) {
    EXPECT_EQ(SYSTEM_SETTINGS_KEY_LOCALE_COUNTRY, 12);
    EXPECT_EQ(SYSTEM_SETTINGS_KEY_LOCALE_LANGUAGE, 13);
}

TEST(SystemSettings, RefuseOtherKeysAndNull) {
    const TemporaryDevice device;
    char* value = nullptr;
    EXPECT_EQ(system_settings_get_value_string(static_cast<system_settings_key_e>(14), &value),
              SYSTEM_SETTINGS_ERROR_NOT_SUPPORTED);
    EXPECT_EQ(value, nullptr);
    EXPECT_EQ(system_settings_get_value_string(SYSTEM_SETTINGS_KEY_LOCALE_LANGUAGE, nullptr),
              SYSTEM_SETTINGS_ERROR_INVALID_PARAMETER);
}

}  // namespace
