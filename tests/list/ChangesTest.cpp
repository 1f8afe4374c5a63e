#include "ListTest.h"

#include <device/Keys.h>

using testing::AllOf;
using testing::Contains;
using testing::ElementsAre;
using testing::IsEmpty;
using testing::Not;
using testing::Pair;
using Type = device::PackageEvent::Type;
using State = device::PackageEvent::State;

namespace {

/// Has the main loop always something to do.
class BusyLoop {
public:
    BusyLoop() { again(this); }
    ~BusyLoop() { ecore_job_del(job_); }
    BusyLoop(const BusyLoop&) = delete;
    BusyLoop& operator=(const BusyLoop&) = delete;

private:
    static void again(void* data) { static_cast<BusyLoop*>(data)->job_ = ecore_job_add(again, data); }
    Ecore_Job* job_ = nullptr;
};

}  // namespace

/// What changes on the device while the list is shown, or lies beneath the pager.
class Change : public ListTest {
protected:
    void setTheme(const std::string& theme) {
        device()->settings().set(device::keys::theme, theme);
        settle();
    }
    void publish(Type type, State state) {
        device()->events().publishPackage({"com.example.other", type, state, 100, 0});
        settle();
    }
    /// A load with force leaves this trace; one from a valid cache does not.
    static auto loadedFromFiles() { return Contains(kest_log::begin("KestContentMgr.cpp", "__loadDetailMenu")); }
    static auto loaded() { return Contains(kest_log::begin("KestContentMgr.cpp", "loadContentsList")); }
    /// Forgets what the list has asked of EFL so far.
    static void forgetCalls() { calls::made().clears = calls::made().updates = 0; }

    void writeTranslatedTip() {
        writeTip("<title id=\"IDS_MINE\">x</title><appname id=\"IDS_OWN\">x</appname>");
        writeStrings({{"en", "IDS_MINE", "Mine"}, {"ko", "IDS_MINE", "내 것"}});
    }
};

TEST_F(Change, OfTheLanguageRefreshesTheTexts) {
    writeTranslatedTip();
    start();
    ASSERT_THAT(menuTexts(), ElementsAre(Pair("Own text", "Mine")));
    setLanguage("ko_KR.UTF-8");
    settle();
    EXPECT_THAT(menuTexts(), ElementsAre(Pair("자체 텍스트", "내 것")));
    EXPECT_EQ(text(titleRow(), "elm.text.main"), "팁 및 안내");
    EXPECT_EQ(text(naviframe().getTopView()->getNaviItem(), "elm.text.title"), "팁");
}

TEST_F(Change, OfTheLanguageRefreshesTheTextsOfALoopThatIsNeverIdle) {
    writeTranslatedTip();
    start();
    const BusyLoop busy;
    setLanguage("ko_KR.UTF-8");
    test_ui::runFor(0.01);
    EXPECT_THAT(menuTexts(), ElementsAre(Pair("자체 텍스트", "내 것")));
}

TEST_F(Change, OfTheLanguageKeepsTheRows) {
    writeTranslatedTip();
    start();
    const auto before = test_ui::rows(list());
    forgetCalls();
    setLanguage("ko_KR.UTF-8");
    settle();
    EXPECT_EQ(test_ui::rows(list()), before);
    EXPECT_EQ(calls::made().clears, 0);
    EXPECT_EQ(calls::made().updates, 1);
}

TEST_F(Change, OfTheLanguageLoadsTheCatalogueOnce) {
    writeTranslatedTip();
    start();
    newLog();
    setLanguage("ko_KR.UTF-8");
    settle();
    const auto lines = newLog();
    EXPECT_EQ(std::count(lines.begin(), lines.end(), kest_log::begin("KestContentMgr.cpp", "loadContentsList")), 1);
    EXPECT_THAT(lines, loadedFromFiles());
}

TEST_F(Change, OfTheLanguageClosesThePager) {
    writeTranslatedTip();
    start();
    openPager();
    setLanguage("ko_KR.UTF-8");
    settle();
    EXPECT_EQ(topView(), "KestMainView");
    EXPECT_THAT(menuTexts(), ElementsAre(Pair("자체 텍스트", "내 것")));
}

TEST_F(Change, OfTheLanguageLeavesTheListWhenItIsOnTop) {
    writeTranslatedTip();
    start();
    setLanguage("ko_KR.UTF-8");
    settle();
    EXPECT_EQ(topView(), "KestMainView");
    setLanguage("en_US.UTF-8");
    settle();
    EXPECT_EQ(topView(), "KestMainView");
    EXPECT_THAT(menuTexts(), ElementsAre(Pair("Own text", "Mine")));
}

TEST_F(Change, OfTheLanguageRightBeforeTheEndIsHarmless) {
    writeTranslatedTip();
    start();
    setLanguage("ko_KR.UTF-8");
    running_.reset();
}

TEST_F(Change, OfTheLanguageWithoutAViewIsAnErrorLine) {
    writeTips({"A"});
    start();
    newLog();
    calls::made().smartCallbacks.at("language,changed")(nullptr, list(), nullptr);
    EXPECT_THAT(newLog(), ElementsAre(list_log::error("__languageChangedCb", "data is null")));
}

TEST_F(Change, OfTheThemeLoadsFromTheCacheAndRefreshes) {
    writeTips({"A"});
    start();
    const auto before = test_ui::rows(list());
    forgetCalls();
    newLog();
    setPreference("contents_tip0.xml_menuTitle", "Cached");
    setTheme("dark");
    EXPECT_THAT(newLog(), AllOf(loaded(), Not(loadedFromFiles())));
    EXPECT_THAT(menuTexts(), ElementsAre(Pair("Name of A", "Cached")));
    EXPECT_EQ(test_ui::rows(list()), before);
    EXPECT_EQ(calls::made().clears, 0);
    EXPECT_EQ(calls::made().updates, 1);
}

TEST_F(Change, OfTheThemeLeavesThePagerOpen) {
    writeTips({"A"});
    start();
    openPager();
    setTheme("dark");
    EXPECT_EQ(topView(), "KestContentView");
}

TEST_F(Change, OfTheThemeWithoutAViewIsAnErrorLine) {
    writeTips({"A"});
    start();
    newLog();
    calls::made().themeCallback(nullptr);
    EXPECT_THAT(newLog(), ElementsAre(list_log::error("__themeChangedCb", "data is null")));
}

TEST_F(Change, ByAnInstalledApplicationRebuildsTheRows) {
    writeTips({"A"});
    writeMenus({{"contents/tip0.xml"}, {"contents/tip.xml", "com.example.clock"}});
    start();
    ASSERT_THAT(menuTexts(), ElementsAre(Pair("Name of A", "A")));
    const auto source = device().folder() / "com.example.clock";
    support::TemporaryDevice::makePackage(source, "com.example.clock");
    support::writeFile(source / "shared/res/contents/tip.xml",
                       kest_files::detail("<title>B</title><appname>Clock</appname>"));
    forgetCalls();
    newLog();
    device()->packages().install(source);
    settle();
    EXPECT_THAT(menuTexts(), ElementsAre(Pair("Name of A", "A"), Pair("Clock", "B")));
    EXPECT_EQ(text(titleRow(), "elm.text.main"), "Tips and guidelines");
    EXPECT_EQ(calls::made().clears, 1);
    EXPECT_THAT(newLog(), loadedFromFiles());
}

TEST_F(Change, ByAnUninstalledApplicationRebuildsTheRows) {
    addApplication("com.example.clock");
    writeDetail("<title>B</title>", tipPath, "com.example.clock");
    writeTips({"A"});
    writeMenus({{tipPath, "com.example.clock"}, {"contents/tip0.xml"}});
    start();
    ASSERT_THAT(menuTexts(), ElementsAre(Pair("", "B"), Pair("Name of A", "A")));
    device()->packages().uninstall("com.example.clock");
    settle();
    EXPECT_THAT(menuTexts(), ElementsAre(Pair("Name of A", "A")));
    openPager(0);
    EXPECT_THAT(usageExtras(), ElementsAre("A"));
}

TEST_F(Change, ByAnInstalledApplicationClosesThePager) {
    writeTips({"A"});
    start();
    openPager();
    publish(Type::Install, State::Completed);
    EXPECT_EQ(topView(), "KestMainView");
}

TEST_F(Change, ByAnUninstalledApplicationClosesThePager) {
    writeTips({"A"});
    start();
    openPager();
    publish(Type::Uninstall, State::Completed);
    EXPECT_EQ(topView(), "KestMainView");
}

TEST_F(Change, ByAnInstalledApplicationLeavesTheListWhenItIsOnTop) {
    writeTips({"A"});
    start();
    publish(Type::Install, State::Completed);
    EXPECT_EQ(topView(), "KestMainView");
    EXPECT_THAT(menuTexts(), ElementsAre(Pair("Name of A", "A")));
}

TEST_F(Change, ByAnythingElseThatHappensToPackagesIsIgnored) {
    writeTips({"A"});
    start();
    openPager();
    forgetCalls();
    newLog();
    for (const Type type : {Type::Install, Type::Uninstall, Type::Update})
        for (const State state : {State::Started, State::Processing, State::Failed})
            publish(type, state);
    publish(Type::Update, State::Completed);
    EXPECT_THAT(newLog(), IsEmpty());
    EXPECT_EQ(calls::made().clears, 0);
    EXPECT_EQ(topView(), "KestContentView");
}

TEST_F(Change, ByAPackageWithoutAViewIsAnErrorLine) {
    writeTips({"A"});
    start();
    newLog();
    const auto tell = calls::made().packageCallback;
    tell("tpk", "com.example.other", PACKAGE_MANAGER_EVENT_TYPE_UNINSTALL, PACKAGE_MANAGER_EVENT_STATE_COMPLETED, 100,
         PACKAGE_MANAGER_ERROR_NONE, nullptr);
    EXPECT_THAT(newLog(), ElementsAre(list_log::error("__packageEventCb", "data is null")));
    tell("tpk", "com.example.other", PACKAGE_MANAGER_EVENT_TYPE_UPDATE, PACKAGE_MANAGER_EVENT_STATE_COMPLETED, 100,
         PACKAGE_MANAGER_ERROR_NONE, nullptr);
    EXPECT_THAT(newLog(), IsEmpty()) << "an update is of no interest in the first place";
}

/// A reload that leaves fewer menus than the list has rows.
class Shrunk : public Change {
protected:
    void shrink() {
        writeTips({"A", "B", "C"});
        start();
        writeMenus({{"contents/tip0.xml"}});
        setTheme("dark");
    }
};

TEST_F(Shrunk, CatalogueLeavesRowsWithoutTexts) {
    shrink();
    EXPECT_THAT(menuTexts(), ElementsAre(Pair("Name of A", "A"), Pair("", ""), Pair("", "")));
    EXPECT_EQ(elm_object_item_part_content_get(menuRow(1), "elm.icon.1"), nullptr);
}

TEST_F(Shrunk, CatalogueHasRowsThatOpenNothing) {
    shrink();
    newLog();
    tap(menuRow(2));
    settle();
    EXPECT_THAT(newLog(), ElementsAre(list_log::info("__selectItemCb", "selected index:4"),
                                      list_log::error("__selectItemCb", "no record for index:4")));
    EXPECT_EQ(topView(), "KestMainView");
    EXPECT_THAT(device()->usage().all(), IsEmpty());
    EXPECT_FALSE(elm_genlist_item_selected_get(menuRow(2)));
}

TEST_F(Shrunk, CatalogueHasRowsThatStillWork) {
    shrink();
    openPager(0);
    EXPECT_THAT(usageExtras(), ElementsAre("A"));
}

TEST_F(Shrunk, CatalogueMayHaveGoneAltogether) {
    writeTips({"A", "B"});
    start();
    std::filesystem::remove(mainMenuFile());
    setTheme("dark");
    EXPECT_THAT(menuTexts(), ElementsAre(Pair("", ""), Pair("", "")));
    setLanguage("ko_KR.UTF-8");
    settle();
    tap(menuRow(0));
    EXPECT_EQ(topView(), "KestMainView");
    publish(Type::Install, State::Completed);
    EXPECT_EQ(test_ui::rows(list()).size(), 1U);
}

TEST_F(Shrunk, CatalogueThatGrowsAgainFillsTheRows) {
    shrink();
    writeTips({"A", "B", "C"});
    setTheme("light");
    EXPECT_THAT(menuTexts(), ElementsAre(Pair("Name of A", "A"), Pair("Name of B", "B"), Pair("Name of C", "C")));
}

TEST_F(Change, WithoutMemoryForItLeavesTheListAsItIsAndALine) {
    writeTips({"A", "B"});
    start();
    calls::made().outOfMemory = true;
    newErrors();
    setTheme("dark");
    EXPECT_THAT(newErrors(), ElementsAre(list_log::error("__themeChangedCb", "std::bad_alloc")));
    publish(Type::Install, State::Completed);
    EXPECT_THAT(newErrors(), ElementsAre(list_log::error("__packageEventCb", "std::bad_alloc")));
    EXPECT_EQ(test_ui::rows(list()).size(), 3U);
}
