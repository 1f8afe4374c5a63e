#include "Views.h"

#include "support/TemporaryDevice.h"
#include "ui/RunningApp.h"
#include "ui/UiTest.h"

#include <Ecore_Evas.h>
#include <app-assist/WApp.h>
#include <app-assist/WNaviframe.h>
#include <app-assist/WWindow.h>
#include <app_extension.h>
#include <device/Keys.h>
#include <gmock/gmock.h>

using app_assist::WApp;
using app_assist::WNaviframe;
using app_assist::WWindow;
using test_ui::Rect;
using test_ui::RunningApp;

namespace {

/// An application with one window that holds one view, made as an application of the device makes it.
class WindowApp : public WApp {
public:
    bool takesWindowAhead = true;
    bool hasWindow = true;
    Evas_Object* ahead = nullptr;
    Story story;
    WNaviframe* naviframe = nullptr;
    TellingView* view = nullptr;

protected:
    bool onCreate() override {
        auto* window = new WWindow("Sample", ELM_WIN_BASIC);
        window->setOnCreateWin([this, window]() -> Evas_Object* { return makeWindow(window); });
        attachWindow(window);
        naviframe = new WNaviframe();
        getWindow()->attachBaseUiObject(naviframe, nullptr);
        return true;
    }
    void onAppControl(app_control_h, bool) override {
        view = new TellingView("view", story);
        naviframe->push(view, nullptr, nullptr);
    }

private:
    Evas_Object* makeWindow(WWindow* window) {
        if (!hasWindow)
            return nullptr;
        if (takesWindowAhead)
            ahead = static_cast<Evas_Object*>(app_get_preinitialized_window(window->getName()));
        Evas_Object* made = ahead ? ahead : elm_win_add(nullptr, window->getName(), window->getWinType());
        evas_object_show(made);
        elm_win_autodel_set(made, EINA_TRUE);
        return made;
    }
};

class Window : public test_ui::UiTest {
protected:
    void begin() {
        running_.emplace(app_);
        test_ui::runFor(0.5);
    }

    support::TemporaryDevice device_;
    WindowApp app_;
    std::optional<RunningApp> running_;
};

TEST_F(Window, IsAsLargeAsTheDevicesDisplay) {
    for (const char* profile : {"480x800", "720x1280"}) {
        running_.reset();
        device_->settings().set(device::keys::screen, profile);
        begin();
        const auto& screen = device_->screen();
        const Rect display{0, 0, screen.width, screen.height};
        EXPECT_EQ(display, test_ui::geometry(running_->window()));
        EXPECT_EQ(display, test_ui::geometry(app_.naviframe->getEvasObj()));
        EXPECT_EQ(screen.width, running_->screen().picture().width());
        EXPECT_EQ(screen.height, running_->screen().picture().height());
    }
}

TEST_F(Window, OfTheApplicationsOwnMakingIsThatLargeToo) {
    app_.takesWindowAhead = false;
    begin();
    EXPECT_EQ((Rect{0, 0, 720, 1280}), test_ui::geometry(running_->window()));
    EXPECT_EQ(nullptr, app_.ahead);
}

TEST_F(Window, KeepsItsSizeWhateverIsInIt) {
    begin();
    Evas_Object* huge = evas_object_rectangle_add(evas_object_evas_get(running_->window()));
    evas_object_size_hint_min_set(huge, 3000, 3000);
    Evas_Object* box = elm_box_add(app_.naviframe->getEvasObj());
    elm_box_pack_end(box, huge);
    elm_naviframe_item_push(app_.naviframe->getEvasObj(), nullptr, nullptr, nullptr, box, nullptr);
    test_ui::runFor(1.0);
    EXPECT_EQ((Rect{0, 0, 720, 1280}), test_ui::geometry(running_->window()));
}

TEST_F(Window, MadeAheadIsHandedOutOnceAndUnderItsNewName) {
    begin();
    ASSERT_NE(nullptr, app_.ahead);
    EXPECT_EQ(app_.ahead, running_->window());
    const char* name = nullptr;
    ecore_evas_name_class_get(ecore_evas_ecore_evas_get(evas_object_evas_get(app_.ahead)), &name, nullptr);
    EXPECT_STREQ("Sample", name);
    EXPECT_EQ(nullptr, app_get_preinitialized_window("Sample"));
}

TEST_F(Window, MadeAheadButNotTakenGoesAtTheEnd) {
    app_.takesWindowAhead = false;
    begin();
    EXPECT_EQ(2u, eina_list_count(ecore_evas_ecore_evas_list_get()));
    running_.reset();
    EXPECT_EQ(0u, eina_list_count(ecore_evas_ecore_evas_list_get()));
    EXPECT_EQ(nullptr, app_get_preinitialized_window("Sample"));
}

TEST_F(Window, KnowsWhatIsInIt) {
    begin();
    EXPECT_EQ(app_.naviframe, app_.getWindow()->getBaseUiObject());
    EXPECT_EQ(app_.getWindow(), app_.naviframe->getWindow());
    EXPECT_EQ(app_.getWindow(), app_.view->getWindow());
    EXPECT_STREQ("Sample", app_.getWindow()->getName());
    EXPECT_EQ(ELM_WIN_BASIC, app_.getWindow()->getWinType());
}

TEST_F(Window, ClosedByItsUserEndsTheApplication) {
    begin();
    Ecore_Evas* frame = ecore_evas_ecore_evas_get(evas_object_evas_get(running_->window()));
    test_ui::inMainLoop([&] { evas_object_smart_callback_call(running_->window(), "delete,request", nullptr); });
    EXPECT_TRUE(test_ui::hasEnded());
    EXPECT_NE(nullptr, frame);
}

TEST_F(Window, DeletedEndsTheApplicationAndTakesItsViewsAlong) {
    begin();
    app_.story.clear();
    test_ui::inMainLoop([&] { evas_object_del(running_->window()); });
    EXPECT_TRUE(test_ui::hasEnded());
    EXPECT_EQ((Story{"view: onDestroy", "view: deleted"}), app_.story);
    EXPECT_EQ(nullptr, app_.getWindow()->getEvasObj());
    EXPECT_EQ(nullptr, app_.naviframe->getEvasObj());
}

TEST_F(Window, GoesWithItsViewsAtTheEndOfTheApplication) {
    begin();
    app_.story.clear();
    running_.reset();
    EXPECT_EQ((Story{"view: onDestroy", "view: deleted"}), app_.story);
    EXPECT_EQ(nullptr, app_.getWindow());
}

TEST_F(Window, ThatCannotBeMadeLeavesTheApplicationRunningWithoutOne) {
    app_.hasWindow = false;
    begin();
    EXPECT_EQ(nullptr, running_->window());
    EXPECT_EQ(nullptr, app_.naviframe->getEvasObj());
    EXPECT_EQ((Story{"view: deleted"}), app_.story);
    EXPECT_FALSE(test_ui::hasEnded());
    EXPECT_THAT(device_.logMessages(), testing::IsSupersetOf({"E APP_ASSIST the window Sample could not be made",
                                                              "E APP_ASSIST the view view could not be pushed"}));
}

TEST_F(Window, MayHoldASingleViewInsteadOfANaviframe) {
    begin();
    app_.story.clear();
    app_.getWindow()->attachBaseUiObject(new TellingView("alone", app_.story), nullptr);
    EXPECT_EQ((Story{"view: onDestroy", "view: deleted", "alone: onCreate", "alone: onCreated"}), app_.story);
    EXPECT_EQ((Rect{0, 0, 720, 1280}), test_ui::geometry(app_.getWindow()->getBaseUiObject()->getEvasObj()));
}

}  // namespace
