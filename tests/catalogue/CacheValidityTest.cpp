#include "CacheTest.h"

using namespace manager_log;
using testing::Contains;
using testing::ElementsAre;
using testing::Not;
using namespace preference_calls;

namespace {

/// The log of a load from the files that says why it does not use the cache.
auto isLogOfLoadBecauseOf(const char* reason) {
    return ElementsAre(begin("loadContentsList"), begin("__loadMainMenu"), info("__checkCacheAvailable", reason),
                       begin("__loadDetailMenu"), begin("__loadStringResource"), hit("__saveToPreference"));
}

}  // namespace

TEST_F(Cache, IsNotUsedWhenALoadIsForced) {
    fill();
    writeDetail("<title>Changed</title>");
    EXPECT_THAT(titles(load(true)), ElementsAre("Changed"));
    EXPECT_THAT(log(), Not(Contains(info("__checkCacheAvailable", "Language changed"))));
    EXPECT_THAT(log(), Not(Contains(info("__checkCacheAvailable", "Version changed!!"))));
}

TEST_F(Cache, IsNotAskedWhetherItIsValidWhenALoadIsForced) {
    fill();
    setLanguage("ko_KR.UTF-8");
    asked.clear();
    load(true);
    EXPECT_THAT(asked, testing::IsEmpty());
    EXPECT_THAT(log(), Not(Contains(info("__checkCacheAvailable", "Language changed"))));
}

TEST_F(Cache, IsInvalidWithoutALineWhenItHasNoLanguage) {
    writeTip("<title>A</title>");
    device()->preferences().clear(kest);
    loadAtNextStart();
    EXPECT_THAT(log(), ElementsAre(begin("loadContentsList"), begin("__loadMainMenu"), begin("__loadDetailMenu"),
                                   begin("__loadStringResource"), hit("__saveToPreference")));
}

TEST_F(Cache, IsAskedForItsLanguageBeforeTheDeviceIs) {
    writeTip("<title>A</title>");
    device()->preferences().clear(kest);
    device()->settings().remove(device::keys::language);
    loadAtNextStart();
    EXPECT_THAT(log(), ElementsAre(begin("loadContentsList"), begin("__loadMainMenu"), begin("__loadDetailMenu"),
                                   begin("__loadStringResource"), hit("__saveToPreference")));
    EXPECT_EQ(preference("KestCurrentLanguage"), std::nullopt);
}

TEST_F(Cache, IsInvalidForAnotherLanguage) {
    fill();
    setLanguage("ko_KR.UTF-8");
    loadAtNextStart();
    EXPECT_THAT(log(), isLogOfLoadBecauseOf("Language changed"));
    EXPECT_EQ(preference("KestCurrentLanguage"), "ko_KR.UTF-8");
}

TEST_F(Cache, ComparesLanguagesExactly) {
    fill();
    setLanguage("en_US");
    loadAtNextStart();
    EXPECT_THAT(log(), Contains(info("__checkCacheAvailable", "Language changed")));
    EXPECT_TRUE(loadedFromFiles());
}

TEST_F(Cache, IsInvalidWhenTheDeviceNamesNoLanguage) {
    fill();
    device()->settings().remove(device::keys::language);
    loadAtNextStart();
    EXPECT_THAT(log(), Contains(info("__checkCacheAvailable", "Language changed")));
    EXPECT_TRUE(loadedFromFiles());
}

TEST_F(Cache, IsInvalidForAnotherVersion) {
    fill();
    upgradeTo("1.0.1");
    loadAtNextStart();
    EXPECT_THAT(log(), isLogOfLoadBecauseOf("Version changed!!"));
    EXPECT_EQ(preference("KestPackageVersion"), "1.0.1");
}

TEST_F(Cache, IsInvalidAfterALoadThatWasCutShort) {
    fill();
    setPreference("KestPackageVersion", "");
    loadAtNextStart();
    EXPECT_THAT(log(), Contains(info("__checkCacheAvailable", "Version changed!!")));
    EXPECT_TRUE(loadedFromFiles());
    EXPECT_EQ(preference("KestPackageVersion"), "1.0.0");
}

TEST_F(Cache, IsValidForAnEmptyVersionOfAPackageWithoutOne) {
    upgradeTo("");
    fill();
    ASSERT_EQ(preference("KestPackageVersion"), "");
    EXPECT_THAT(titles(loadAtNextStart()), ElementsAre("Cached"));
    EXPECT_FALSE(loadedFromFiles());
}

TEST_F(Cache, IsValidWhenItsVersionCannotBeRead) {
    fill();
    const auto all = device()->preferences().all(kest);
    device()->preferences().clear(kest);
    for (const auto& [key, value] : all)
        if (key != "KestPackageVersion")
            setPreference(key, value);
    EXPECT_THAT(titles(loadAtNextStart()), ElementsAre("Cached"));
    EXPECT_FALSE(loadedFromFiles());
}

TEST_F(Cache, FollowsTheRegionOfTheMainMenuFile) {
    writeDetail("<title>A</title>", "contents/a.xml");
    writeDetail("<title>B</title>", "contents/b.xml");
    writeMenus({{"contents/a.xml"}, {"contents/b.xml", kest, "Global,India"}});
    EXPECT_THAT(titles(load()), ElementsAre("A", "B"));
    setCountry("IN");
    EXPECT_THAT(titles(loadAtNextStart()), ElementsAre("B"));
    EXPECT_FALSE(loadedFromFiles());
}

TEST_F(Cache, OfNoLanguageIsInvalidWhereTheDeviceNamesNone) {
    fill();
    setPreference("KestCurrentLanguage", "");
    device()->settings().remove(device::keys::language);
    loadAtNextStart();
    EXPECT_TRUE(loadedFromFiles());
    EXPECT_THAT(log(), Contains(info("__checkCacheAvailable", "Language changed")));
}
