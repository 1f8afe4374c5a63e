#include "ShellTest.h"

#include <app-assist/WWindow.h>
#include <device/Keys.h>
#include <system_settings.h>

using testing::Contains;
using testing::ElementsAre;
using testing::IsEmpty;
using testing::Not;

int entryPoint(int argc, char** argv);

class AppTest : public ShellTest {
protected:
    /// Starts the application without a first view.
    void startWithoutView() {
        app_.takesRequests = false;
        start();
    }
    kest_log::Line begin(const std::string& function) const { return kest_log::begin("KestApp.cpp", function); }
    kest_log::Line error(const std::string& function, const std::string& message) const {
        return kest_log::error("KestApp.cpp", function, message);
    }
};

TEST_F(AppTest, IsCreatedStepByStep) {
    startWithoutView();
    EXPECT_EQ(running().status(), std::nullopt);
    std::vector<std::string> steps = calls::madeOf({"addEvent", "app_get_preinit", "elm_win_", "elm_app_base",
                                                    "elm_naviframe", "uxt_theme_add", "uxt_theme_set_font"});
    // The window that the launcher makes ahead.
    steps.erase(steps.begin());
    EXPECT_THAT(steps,
                ElementsAre("addEventHandler 2 application", "app_get_preinitialized_window Kest",
                            "elm_win_title_set Kest shown", "elm_win_autodel_set true",
                            "elm_win_wm_rotation_supported_get", "elm_win_indicator_mode_set 2",
                            "elm_win_indicator_opacity_set 1", "elm_app_base_scale_set 2.6", "elm_naviframe_add",
                            "elm_naviframe_prev_btn_auto_pushed_set naviframe true",
                            "uxt_theme_add_color_table " + resource("table/com.ravella.kest_ChangeableColorInfo.xml"),
                            "uxt_theme_add_font_table " + resource("table/com.ravella.kest_ChangeableFontInfo.xml"),
                            "uxt_theme_set_font_table table"));
}

TEST_F(AppTest, HasAWindowOfItsName) {
    startWithoutView();
    EXPECT_STREQ(app_.getWindow()->getName(), "Kest");
    EXPECT_EQ(app_.getWindow()->getWinType(), ELM_WIN_BASIC);
    EXPECT_STREQ(elm_win_title_get(running().window()), "Kest");
    EXPECT_TRUE(evas_object_visible_get(running().window()));
    EXPECT_TRUE(elm_win_autodel_get(running().window()));
}

TEST_F(AppTest, HasANaviframeThatMakesBackButtonsByItself) {
    startWithoutView();
    EXPECT_TRUE(elm_naviframe_prev_btn_auto_pushed_get(naviframe().getEvasObj()));
    EXPECT_EQ(naviframe().getTopView(), nullptr);
}

TEST_F(AppTest, IsDrawnForItsScale) {
    startWithoutView();
    EXPECT_DOUBLE_EQ(elm_app_base_scale_get(), 2.6);
}

TEST_F(AppTest, LoadsNoCatalogueAndShowsNoViewBeforeItIsAskedTo) {
    startWithoutView();
    const auto lines = newLog();
    EXPECT_THAT(lines, Not(Contains(kest_log::begin("KestContentMgr.cpp", "loadContentsList"))));
    EXPECT_THAT(lines, Contains(kest_log::begin("KestCommon.cpp", "setChangeableTable")));
}

TEST_F(AppTest, MakesItsWindowWhereNoneWasMadeAhead) {
    calls::fail("app_get_preinitialized_window");
    startWithoutView();
    EXPECT_THAT(calls::madeOf({"elm_win_add"}), Contains("elm_win_add null Kest 0"));
    EXPECT_STREQ(elm_win_title_get(running().window()), "Kest");
}

TEST_F(AppTest, StaysUprightWhereTheWindowManagerTurnsWindows) {
    calls::setRotationSupported(true);
    startWithoutView();
    EXPECT_THAT(calls::madeOf({"elm_win_wm_rotation"}),
                ElementsAre("elm_win_wm_rotation_supported_get",
                            "elm_win_wm_rotation_available_rotations_set 0 0 0 0 of 1",
                            "elm_win_wm_rotation_preferred_rotation_set 0"));
}

TEST_F(AppTest, AsksForNoRotationWhereTheWindowManagerHasNone) {
    startWithoutView();
    EXPECT_THAT(calls::madeOf({"elm_win_wm_rotation"}), ElementsAre("elm_win_wm_rotation_supported_get"));
}

TEST_F(AppTest, GoesOnWithoutTables) {
    calls::fail("uxt_theme_add_color_table");
    start();
    EXPECT_EQ(running().status(), std::nullopt);
    EXPECT_EQ(topView(), "KestMainView");
    EXPECT_THAT(newLog(), Contains(kest_log::error("KestCommon.cpp", "setChangeableTable",
                                                   "uxt_theme_add_color_table() is failed")));
}

TEST_F(AppTest, GoesOnWithoutAWindow) {
    calls::fail("app_get_preinitialized_window");
    calls::fail("elm_win_add");
    writeTip("<title>Title</title>");
    start();
    EXPECT_EQ(running().status(), std::nullopt);
    EXPECT_EQ(running().window(), nullptr);
    EXPECT_THAT(newLog(), Contains(error("createWindow", "Fail to create win!")));
    setLanguage("ko_KR.UTF-8");
    settle();
    EXPECT_THAT(newLog(), Contains(kest_log::begin("KestContentMgr.cpp", "loadContentsList")));
}

TEST_F(AppTest, ShowsTheListOnTheFirstRequest) {
    writeTip("<title>Title</title>");
    start();
    EXPECT_EQ(topView(), "KestMainView");
    EXPECT_THAT(newLog(), Contains(begin("onAppControl")));
}

TEST_F(AppTest, LeavesThePageOnALaterPlainRequest) {
    start();
    newLog();
    app_control_h request = nullptr;
    ASSERT_EQ(app_control_create(&request), APP_CONTROL_ERROR_NONE);
    const auto* before = naviframe().getTopView();
    app_.onAppControl(request, false);
    settle();
    app_control_destroy(request);
    EXPECT_EQ(naviframe().getTopView(), before);
    EXPECT_EQ(elm_naviframe_bottom_item_get(naviframe().getEvasObj()),
              elm_naviframe_top_item_get(naviframe().getEvasObj()));
}

TEST_F(AppTest, TakesNoRequestThatIsNull) {
    startWithoutView();
    app_.takesRequests = true;
    newLog();
    app_.onAppControl(nullptr, true);
    EXPECT_THAT(newLog(), ElementsAre(begin("onAppControl"), error("onAppControl", "request == NULL")));
    EXPECT_EQ(naviframe().getTopView(), nullptr);
}

TEST_F(AppTest, DoesNothingWhenItPausesOrResumes) {
    startWithoutView();
    newLog();
    calls::forget();
    app_.onPause();
    app_.onResume();
    EXPECT_THAT(newLog(), IsEmpty());
    EXPECT_THAT(calls::made(), IsEmpty());
}

TEST_F(AppTest, FollowsTheLanguageBeforeThereIsAView) {
    writeTip("<title>Title</title>");
    startWithoutView();
    newLog();
    calls::forget();
    setLanguage("ko_KR.UTF-8");
    EXPECT_THAT(calls::madeOf({"elm_language_set"}), ElementsAre("elm_language_set ko_KR"));
    EXPECT_THAT(newLog(), Contains(kest_log::begin("KestContentMgr.cpp", "__loadDetailMenu")));
    EXPECT_EQ(preference("KestCurrentLanguage"), "ko_KR.UTF-8");
}

TEST_F(AppTest, HasTheToolkitTakeTheLanguageBeforeItLoadsAnew) {
    writeTip("<title>Title</title>");
    startWithoutView();
    newLog();
    std::optional<std::vector<kest_log::Line>> linesBefore;
    calls::whenTheLanguageIsSet([&] { linesBefore = newLog(); });
    setLanguage("ko_KR.UTF-8");
    calls::whenTheLanguageIsSet(nullptr);
    EXPECT_THAT(linesBefore, testing::Optional(IsEmpty()));
    EXPECT_THAT(newLog(), Contains(kest_log::begin("KestContentMgr.cpp", "loadContentsList")));
}

TEST_F(AppTest, LoadsAnewAtEveryLanguageChange) {
    writeTip("<title>Title</title>");
    startWithoutView();
    setLanguage("ko_KR.UTF-8");
    newLog();
    setLanguage("ko_KR.UTF-8");
    EXPECT_THAT(newLog(), ElementsAre(kest_log::begin("KestContentMgr.cpp", "loadContentsList"),
                                      kest_log::begin("KestContentMgr.cpp", "__loadMainMenu"),
                                      kest_log::begin("KestContentMgr.cpp", "__loadDetailMenu"),
                                      kest_log::begin("KestContentMgr.cpp", "__loadStringResource"),
                                      kest_log::hit("KestContentMgr.cpp", "__saveToPreference")));
}

TEST_F(AppTest, PassesOnThatTheLanguageCannotBeRead) {
    writeTip("<title>Title</title>");
    startWithoutView();
    newLog();
    calls::forget();
    device::faults::plan("system_settings_get_value_string", SYSTEM_SETTINGS_ERROR_IO_ERROR);
    setLanguage("ko_KR.UTF-8");
    EXPECT_THAT(calls::madeOf({"elm_language_set"}), ElementsAre("elm_language_set null"));
    EXPECT_THAT(newLog(), Contains(kest_log::begin("KestContentMgr.cpp", "__loadDetailMenu")));
}

TEST_F(AppTest, DeletesItsTablesWhenItEnds) {
    startWithoutView();
    newLog();
    calls::forget();
    app_.onTerminate();
    EXPECT_THAT(newLog(), ElementsAre(begin("onTerminate"), kest_log::hit("KestCommon.cpp", "unsetChangeableTable")));
    EXPECT_THAT(calls::made(), ElementsAre("uxt_theme_delete_color_table table", "uxt_theme_delete_font_table table"));
    calls::forget();
    app_.onTerminate();
    EXPECT_THAT(calls::made(), IsEmpty());
}

TEST_F(AppTest, EndsWithNothingLeftBehind) {
    start();
    running_.reset();
    EXPECT_EQ(app_.getWindow(), nullptr);
}

TEST_F(AppTest, NeverCreatedHasNothingToDelete) {
    app_.onTerminate();
    EXPECT_THAT(calls::made(), IsEmpty());
}

/// The program's entry point.
class EntryPoint : public ShellTest {
protected:
    int run(std::vector<std::string> words) {
        words.insert(words.begin(), "kest");
        std::vector<char*> argv;
        for (std::string& word : words)
            argv.push_back(word.data());
        argv.push_back(nullptr);
        return entryPoint(static_cast<int>(words.size()), argv.data());
    }
    static kest_log::Line begin() { return kest_log::begin("main.cpp", "entryPoint"); }
    static kest_log::Line info(const std::string& message) { return kest_log::info("main.cpp", "entryPoint", message); }
};

TEST_F(EntryPoint, ReturnsWhatTheFrameworkReturned) {
    testing::internal::CaptureStderr();
    EXPECT_EQ(run({"no extra"}), 2);
    testing::internal::GetCapturedStderr();
    EXPECT_THAT(newLog(), ElementsAre(begin(), info("app return=2")));
}

TEST_F(EntryPoint, RunsTheApplicationUntilItEnds) {
    ecore_timer_loop_add(
        1.0, [](void*) -> Eina_Bool { return elm_exit(), ECORE_CALLBACK_CANCEL; }, nullptr);
    EXPECT_EQ(run({}), 0);
    const auto lines = newLog();
    ASSERT_FALSE(lines.empty());
    EXPECT_EQ(lines.front(), begin());
    EXPECT_EQ(lines.back(), info("app return=0"));
    EXPECT_EQ(std::count(lines.begin(), lines.end(), info("app return=0")), 1);
    EXPECT_THAT(lines, Contains(kest_log::begin("KestApp.cpp", "onAppControl")));
    EXPECT_THAT(lines, Contains(kest_log::begin("KestApp.cpp", "onTerminate")));
}
