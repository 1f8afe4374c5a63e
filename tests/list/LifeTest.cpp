#include "ListTest.h"

#include "KestMainView.h"

#include <device/Keys.h>

using testing::AllOf;
using testing::ElementsAre;
using testing::HasSubstr;
using testing::IsEmpty;

namespace {

/// The list's view with what the framework asks of it within reach.
struct View : KestMainView {
    using KestMainView::KestMainView;
    using KestMainView::onCreate;
    using KestMainView::onDestroy;
    using KestMainView::onPushToNaviframe;
};

}  // namespace

class Life : public ListTest {
protected:
    /// The application without its first view.
    void startEmpty() {
        app_.takesRequests = false;
        running_.emplace(app_);
        newLog();
    }
};

TEST_F(Life, BeginsWithTheThemesFileAndNoRows) {
    startEmpty();
    calls::made().themeExtensions.clear();
    const View view(true);
    EXPECT_THAT(calls::made().themeExtensions, ElementsAre((device().appRoot() / "res/edje/kest.edj").string()));
    EXPECT_THAT(calls::made().rows, IsEmpty());
    EXPECT_EQ(view.getEvasObj(), nullptr);
}

TEST_F(Life, HasNoRowsUntilItIsPushed) {
    writeTips({"A"});
    startEmpty();
    View view(true);
    Evas_Object* layout = view.onCreate(running().window(), nullptr);
    EXPECT_NE(layout, nullptr);
    EXPECT_THAT(calls::made().rows, IsEmpty());
    evas_object_del(layout);
    view.onDestroy();
}

TEST_F(Life, AddsTheThemesFileOnceForTwoViews) {
    startEmpty();
    const View first(true), second(true);
    const Eina_List* all = elm_theme_extension_list_get(nullptr);
    EXPECT_EQ(eina_list_count(all), 1U);
}

TEST_F(Life, TakesTheThemesFileOfTheDisplaysDensity) {
    const auto theme = device().appRoot() / "res/LDPI/edje/kest.edj";
    std::filesystem::create_directories(theme.parent_path());
    std::filesystem::copy_file(device().appRoot() / "res/edje/kest.edj", theme);
    device()->settings().set(device::keys::screen, "480x800");
    startEmpty();
    calls::made().themeExtensions.clear();
    newLog();
    auto* view = new KestMainView(true);
    EXPECT_THAT(calls::made().themeExtensions, ElementsAre(theme.string()));
    naviframe().push(view, nullptr, nullptr);
    const auto asked = kest_log::info("KestCommon.cpp", "getEdjFilePath", "edje resource path[" + theme.string() + "]");
    EXPECT_EQ(std::ranges::count(newLog(), asked), 2) << "for the theme, and again for the layout";
    const char* file = nullptr;
    const char* group = nullptr;
    elm_layout_file_get(view->getEvasObj(), &file, &group);
    EXPECT_STREQ(file, theme.c_str());
    EXPECT_STREQ(group, "kest/list/main");
}

TEST_F(Life, RegistersAndTakesBackItsCallbacks) {
    writeTips({"A"});
    start();
    EXPECT_THAT(calls::made().registrations, ElementsAre("theme +", "package create", "package set"));
    calls::made().registrations.clear();
    running_.reset();
    EXPECT_THAT(calls::made().registrations, ElementsAre("theme -", "package unset", "package destroy"));
}

TEST_F(Life, ItsEndIsFollowedByNothing) {
    writeTips({"A"});
    startEmpty();
    naviframe().push(new OtherView, nullptr, nullptr);
    naviframe().push(new KestMainView(true), nullptr, nullptr);
    settle();
    elm_naviframe_item_pop(naviframe().getEvasObj());
    settle();
    ASSERT_EQ(topView(), "OtherView");
    newLog();
    device()->settings().set(device::keys::theme, "dark");
    device()->events().publishPackage(
        {"com.example.other", device::PackageEvent::Type::Install, device::PackageEvent::State::Completed, 100, 0});
    settle();
    EXPECT_THAT(newLog(), IsEmpty());
    EXPECT_EQ(topView(), "OtherView");
}

TEST_F(Life, WorksWithoutThePackageManager) {
    writeTips({"A"});
    device::faults::plan("package_manager_create", -5);
    device::faults::plan("package_manager_set_event_cb", -5);
    start();
    EXPECT_EQ(test_ui::rows(list()).size(), 2U);
    EXPECT_THAT(newErrors(), IsEmpty());
}

TEST_F(Life, GoesOnTopWhenItIsPushedSo) {
    writeTips({"A"});
    startEmpty();
    naviframe().push(new OtherView, nullptr, nullptr);
    naviframe().push(new KestMainView(true), nullptr, nullptr);
    EXPECT_EQ(topView(), "KestMainView");
}

TEST_F(Life, SlidesInBeneathWhenItIsPushedSo) {
    writeTips({"A"});
    startEmpty();
    naviframe().push(new OtherView, nullptr, nullptr);
    auto* view = new KestMainView(false);
    naviframe().push(view, nullptr, nullptr);
    EXPECT_EQ(topView(), "OtherView");
    Elm_Object_Item* bottom = elm_naviframe_bottom_item_get(naviframe().getEvasObj());
    EXPECT_EQ(elm_object_item_part_content_get(bottom, nullptr), view->getEvasObj());
    EXPECT_EQ(view->getNaviItem(), bottom);
    EXPECT_EQ(text(bottom, "elm.text.title"), "Tips");
    EXPECT_EQ(elm_object_item_part_content_get(bottom, "elm.swallow.prev_btn"), nullptr);
    EXPECT_EQ(elm_object_item_part_content_get(bottom, "elm.swallow.next_btn"), nullptr);
    elm_naviframe_item_pop(naviframe().getEvasObj());
    settle();
    EXPECT_EQ(topView(), "KestMainView");
    EXPECT_EQ(test_ui::rows(list()).size(), 2U);
}

TEST_F(Life, IsPushedPlainlyWhereNothingIsThereToSlideInBeneath) {
    writeTips({"A"});
    startEmpty();
    naviframe().push(new KestMainView(false), nullptr, nullptr);
    settle();
    EXPECT_EQ(topView(), "KestMainView");
    EXPECT_EQ(levels(), 1U);
    EXPECT_EQ(menuTexts(), std::vector<Texts>({{"Name of A", "A"}}));
}

TEST_F(Life, SlidesInBeneathAllViews) {
    writeTips({"A"});
    startEmpty();
    pushOtherView();
    pushOtherView();
    auto* view = new KestMainView(false);
    naviframe().push(view, nullptr, nullptr);
    for (int above = 2; above > 0; --above) {
        EXPECT_EQ(topView(), "OtherView");
        elm_naviframe_item_pop(naviframe().getEvasObj());
        settle();
    }
    EXPECT_EQ(naviframe().getTopView(), view);
}

TEST_F(Life, EndsWithoutAParent) {
    startEmpty();
    EXPECT_DEATH(
        View(true).onCreate(nullptr, nullptr),
        AllOf(HasSubstr("KestMainView.cpp:"), HasSubstr("__createGenlist: Assertion `(parent != __null)' failed.")));
    EXPECT_THAT(newErrors(), ElementsAre(list_log::error("__createGenlist", "WASSERT! __parent is null.")));
}

TEST_F(Life, EndsWithoutAList) {
    startEmpty();
    calls::made().failGenlist = true;
    EXPECT_DEATH(
        View(true).onCreate(running().window(), nullptr),
        AllOf(HasSubstr("KestMainView.cpp:"), HasSubstr("__createGenlist: Assertion `(__genlist != __null)' failed.")));
    EXPECT_THAT(newErrors(), ElementsAre(list_log::error("__createGenlist", "WASSERT! genlist is not created.")));
}

TEST_F(Life, EndsWhenItIsPushedBeforeItWasMade) {
    startEmpty();
    EXPECT_DEATH(View(true).onPushToNaviframe(naviframe().getEvasObj()),
                 AllOf(HasSubstr("KestMainView.cpp:"),
                       HasSubstr("onPushToNaviframe: Assertion `(getEvasObj() != nullptr)' failed.")));
    EXPECT_THAT(newErrors(), ElementsAre(list_log::error("onPushToNaviframe", "WASSERT! getEvasObj() != nullptr")));
}
