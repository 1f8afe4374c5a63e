#include "KestContentInfo.h"
#include "KestContentMgr.h"

#include <gtest/gtest.h>

#include <type_traits>

TEST(Record, IsEmptyAtFirst) {
    const KestContentInfo record;
    EXPECT_EQ(record.path, "");
    EXPECT_EQ(record.appid, "");
    EXPECT_FALSE(record.isAvailable);
    EXPECT_EQ(record.menuTitle, "");
    EXPECT_EQ(record.titleId, "");
    EXPECT_EQ(record.textContents, "");
    EXPECT_EQ(record.imagePath, "");
    EXPECT_EQ(record.textdomain, "");
    EXPECT_EQ(record.iconPath, "");
    EXPECT_EQ(record.appName, "");
    EXPECT_EQ(record.launchAppid, "");
    EXPECT_EQ(record.launchParamKey, "");
    EXPECT_EQ(record.launchParamValue, "");
}

TEST(Record, HasItsThirteenFieldsInTheirOrder) {
    const KestContentInfo record;
    const auto& [path, appid, isAvailable, menuTitle, titleId, textContents, imagePath, textdomain, iconPath, appName,
                 launchAppid, launchParamKey, launchParamValue] = record;
    EXPECT_EQ(&path, &record.path);
    EXPECT_EQ(&appid, &record.appid);
    EXPECT_EQ(&isAvailable, &record.isAvailable);
    EXPECT_EQ(&menuTitle, &record.menuTitle);
    EXPECT_EQ(&titleId, &record.titleId);
    EXPECT_EQ(&textContents, &record.textContents);
    EXPECT_EQ(&imagePath, &record.imagePath);
    EXPECT_EQ(&textdomain, &record.textdomain);
    EXPECT_EQ(&iconPath, &record.iconPath);
    EXPECT_EQ(&appName, &record.appName);
    EXPECT_EQ(&launchAppid, &record.launchAppid);
    EXPECT_EQ(&launchParamKey, &record.launchParamKey);
    EXPECT_EQ(&launchParamValue, &record.launchParamValue);
}

TEST(Record, IsAPlainValue) {
    static_assert(std::is_copy_constructible<KestContentInfo>::value, "views take copies");
    static_assert(std::is_copy_assignable<KestContentInfo>::value, "views take copies");
    static_assert(!std::is_polymorphic<KestContentInfo>::value, "a record has no virtual operations");
    KestContentInfo record;
    record.menuTitle = "A";
    KestContentInfo copy = record;
    copy.menuTitle = "B";
    EXPECT_EQ(record.menuTitle, "A");
}

TEST(Manager, CanBeDestroyedThroughItsBase) {
    static_assert(std::has_virtual_destructor<KestContentMgr>::value, "its one virtual operation");
    static_assert(!std::is_copy_constructible<KestContentMgr>::value, "one a process");
}
