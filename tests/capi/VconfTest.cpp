#include "vconf.h"

#include "Owned.h"
#include "support/TemporaryDevice.h"

#include <gtest/gtest.h>

namespace {

using support::TemporaryDevice;

TEST(Vconf, GivesTheDevicesSettings) {
    const TemporaryDevice device;
    EXPECT_EQ(owned(vconf_get_str("db/menu_widget/language")), "en_US.UTF-8");
    EXPECT_EQ(owned(vconf_get_str("db/csc/text_string_country")), std::nullopt);
    EXPECT_EQ(vconf_set_str("db/csc/text_string_country", "IN"), 0);
    EXPECT_EQ(owned(vconf_get_str("db/csc/text_string_country")), "IN");
}

TEST(Vconf, TellsOfAChange) {
    const TemporaryDevice device;
    std::string told;
    const auto subscription = device->events().onSetting([&](const std::string& key) { told += key; });
    vconf_set_str("db/setting/theme", "dark");
    EXPECT_EQ(told, "db/setting/theme");
}

TEST(Vconf, KeepsEveryByte) {
    const TemporaryDevice device;
    const std::string large(1024 * 1024, 'x');
    for (const char* text : {"", "it's \"quoted\"", "\xff\xfe", large.c_str()}) {
        ASSERT_EQ(vconf_set_str(text, text), 0);
        EXPECT_EQ(owned(vconf_get_str(text)), text);
    }
}

TEST(Vconf, RefusesNull) {
    const TemporaryDevice device;
    EXPECT_EQ(vconf_get_str(nullptr), nullptr);
    EXPECT_EQ(vconf_set_str(nullptr, "value"), -1);
    EXPECT_EQ(vconf_set_str("key", nullptr), -1);
}

}  // namespace
