#include "CatalogueTest.h"

#include <package_info.h>
#include <package_manager.h>

#include <set>

using namespace manager_log;
using testing::ElementsAre;
using testing::IsEmpty;

extern "C" {
int __real_package_info_create(const char* package, package_info_h* info);
int __wrap_package_info_create(const char* package, package_info_h* info);
int __real_package_manager_get_package_info(const char* package, package_info_h* info);
int __wrap_package_manager_get_package_info(const char* package, package_info_h* info);
int __real_package_info_destroy(package_info_h info);
int __wrap_package_info_destroy(package_info_h info);
}

static std::multiset<package_info_h> held;

static int keep(int result, const package_info_h* info) {
    if (result == PACKAGE_MANAGER_ERROR_NONE)
        held.insert(*info);
    return result;
}

int __wrap_package_info_create(const char* package, package_info_h* info) {
    return keep(__real_package_info_create(package, info), info);
}

int __wrap_package_manager_get_package_info(const char* package, package_info_h* info) {
    return keep(__real_package_manager_get_package_info(package, info), info);
}

int __wrap_package_info_destroy(package_info_h info) {
    held.erase(info);
    return __real_package_info_destroy(info);
}

class Icon : public CatalogueTest {
protected:
    /// The icon of a tip about that application.
    std::string iconOf(const std::string& appid) {
        writeMenus({{tipPath, appid}});
        writeDetail("<title>Title</title>", tipPath, appid);
        return load().at(0).iconPath;
    }
};

TEST_F(Icon, IsThePackages) {
    addApplication("com.example.clock");
    const std::string icon = iconOf("com.example.clock");
    EXPECT_EQ(icon, device()->packages().find("com.example.clock")->icon);
    EXPECT_EQ(std::filesystem::path(icon).filename(), "icon.png");
    EXPECT_THAT(errors(), IsEmpty());
}

TEST_F(Icon, IsATextWhenTheApplicationIsNotInstalled) {
    writeMenus({{"contents/fallback.xml", "com.example.gone"}});
    EXPECT_EQ(load().at(0).iconPath, "No icon Path");
    EXPECT_THAT(errors(),
                ElementsAre(error("__getIconPath", "package_info_create return [" +
                                                       std::to_string(PACKAGE_MANAGER_ERROR_NO_SUCH_PACKAGE) + "]")));
}

TEST_F(Icon, IsATextWhenThePackageNamesNone) {
    support::writeFile(device().preinstalled() / "com.example.plain/tizen-manifest.xml",
                       "<manifest xmlns=\"http://tizen.org/ns/packages\" package=\"com.example.plain\" "
                       "version=\"1.0.0\"><ui-application appid=\"com.example.plain\" exec=\"app\" type=\"capp\"/>"
                       "</manifest>");
    EXPECT_EQ(iconOf("com.example.plain"), "No icon Path");
    EXPECT_THAT(errors(), ElementsAre(error("__getIconPath", "pkgmgrinfo_appinfo_get_icon return [0]")));
}

TEST_F(Icon, IsEmptyWithoutAnApplication) {
    writeMenus({{"contents/fallback.xml", ""}});
    EXPECT_EQ(load().at(0).iconPath, "");
    EXPECT_THAT(errors(), IsEmpty());
}

TEST_F(Icon, IsEmptyWithoutAnApplicationThoughTheCacheHasOne) {
    addApplication("com.example.clock");
    writeMenus({{"contents/fallback.xml", "com.example.clock"}});
    writeDetail("<title>Title</title>", "contents/fallback.xml", "com.example.clock");
    ASSERT_NE(load().at(0).iconPath, "");
    writeMenus({{"contents/fallback.xml", ""}});
    const KestContentInfo record = load(false).at(0);
    EXPECT_EQ(record.menuTitle, "Title") << "from the cache";
    EXPECT_EQ(record.iconPath, "");
}

TEST_F(Icon, IsATextInTheCachedPathToo) {
    writeMenus({{"contents/fallback.xml", "com.example.gone"}});
    load();
    EXPECT_EQ(load(false).at(0).iconPath, "No icon Path");
    EXPECT_EQ(errors().size(), 1U);
}

TEST_F(Icon, IsATextWhenThePackageCannotBeAsked) {
    addApplication("com.example.clock");
    device::faults::plan("package_info_create", -5, 100);
    EXPECT_EQ(iconOf("com.example.clock"), "No icon Path");
    EXPECT_THAT(errors(), ElementsAre(error("__getIconPath", "package_info_create return [-5]")));
}

TEST_F(Icon, IsATextWhenThePackageDoesNotTellIt) {
    addApplication("com.example.clock");
    device::faults::plan("package_info_get_icon", -5, 100);
    EXPECT_EQ(iconOf("com.example.clock"), "No icon Path");
    EXPECT_THAT(errors(), ElementsAre(error("__getIconPath", "pkgmgrinfo_appinfo_get_icon return [-5]")));
}

TEST_F(Icon, IsCopiedFromAHandleThatIsDestroyed) {
    addApplication("com.example.clock");
    EXPECT_NE(iconOf("com.example.clock"), "");
    EXPECT_THAT(held, IsEmpty());
    device::faults::plan("package_info_get_icon", -5, 1);
    EXPECT_EQ(iconOf("com.example.clock"), "No icon Path");
    EXPECT_THAT(held, IsEmpty());
}
