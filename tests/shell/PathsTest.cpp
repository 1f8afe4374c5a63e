// As on the device, where nobody says that the package is elsewhere.
#undef KEST_APP_ROOT
#include "KestPaths.h"

#include <gtest/gtest.h>

TEST(Paths, OnTheDeviceAreThoseOfItsPackage) {
    EXPECT_STREQ(kest_paths::sharedResources, "/opt/usr/apps/com.ravella.kest/shared/res/");
    EXPECT_STREQ(kest_paths::locale, "/opt/usr/apps/com.ravella.kest/res/locale");
    EXPECT_STREQ(kest_paths::systemLocale, "/usr/share/locale");
    EXPECT_STREQ(KEST_APP_ID, "com.ravella.kest");
}
