#include "KestApp.h"

#include "KestCommon.h"
#include "KestContentMgr.h"
#include "KestLog.h"
#include "KestMainView.h"
#include "KestPlatformString.h"

#include <app-assist/WNaviframe.h>
#include <app-assist/WWindow.h>
#include <app_extension.h>
#include <system_settings.h>

namespace {

/// The scale that the screens were drawn for.
const double baseScale = 2.6;

void allowPortraitOnly(Evas_Object* window) {
    if (!elm_win_wm_rotation_supported_get(window)) {
        return;
    }
    const int rotations[4] = {0, 0, 0, 0};
    elm_win_wm_rotation_available_rotations_set(window, rotations, 1);
    elm_win_wm_rotation_preferred_rotation_set(window, 0);
}

Evas_Object* createWindow(const app_assist::WWindow* window) {
    Evas_Object* win = static_cast<Evas_Object*>(app_get_preinitialized_window(window->getName()));
    if (!win) {
        win = elm_win_add(nullptr, window->getName(), window->getWinType());
    }
    if (!win) {
        KEST_ERR("Fail to create win!");
        return nullptr;
    }
    evas_object_show(win);
    elm_win_title_set(win, window->getName());
    elm_win_autodel_set(win, EINA_TRUE);
    allowPortraitOnly(win);
    elm_win_indicator_mode_set(win, ELM_WIN_INDICATOR_SHOW);
    elm_win_indicator_opacity_set(win, ELM_WIN_INDICATOR_OPAQUE);
    return win;
}

/// False when the request has no such extra.
bool readExtra(app_control_h request, const char* key, std::string& result) {
    KestPlatformString value;
    if (app_control_get_extra_data(request, key, value.out()) != APP_CONTROL_ERROR_NONE) {
        return false;
    }
    result = value.str();
    return true;
}

}  // namespace

KestApp::KestApp() : colorTable(nullptr), fontTable(nullptr), mainView(nullptr) {}

KestApp::~KestApp() = default;

bool KestApp::onCreate() {
    eventHandler.addEventHandler(APP_EVENT_LANGUAGE_CHANGED, &KestApp::__languageChanged, this);

    auto* window = new app_assist::WWindow("Kest", ELM_WIN_BASIC);
    window->setOnCreateWin([window]() { return createWindow(window); });
    attachWindow(window);
    elm_app_base_scale_set(baseScale);

    auto* naviframe = new app_assist::WNaviframe();
    getWindow()->attachBaseUiObject(naviframe, nullptr);
    elm_naviframe_prev_btn_auto_pushed_set(naviframe->getEvasObj(), EINA_TRUE);

    KestCommon::setChangeableTable(nullptr, &colorTable, &fontTable);
    return true;
}

void KestApp::onTerminate() {
    KEST_BEGIN();
    KestCommon::unsetChangeableTable(&colorTable, &fontTable);
}

void KestApp::onPause() {}

void KestApp::onResume() {}

void KestApp::onAppControl(app_control_h request, bool firstLaunch) {
    KEST_BEGIN();
    if (!request) {
        KEST_ERR("request == NULL");
        return;
    }
    std::string appId;
    if (!readExtra(request, "appID", appId)) {
        KEST_INFO("app_control_get_extra_data() appID Failed");
    }
    auto* naviframe = getWindow() ? static_cast<app_assist::WNaviframe*>(getWindow()->getBaseUiObject()) : nullptr;
    if (!firstLaunch || !naviframe) {
        return;
    }
    mainView = new KestMainView(true);
    naviframe->push(mainView, nullptr, nullptr);
    if (!naviframe->isTopView(mainView)) {
        // The naviframe has freed a view that it could not push.
        mainView = nullptr;
    }
}

void KestApp::__languageChanged(app_event_info_h, void*) {
    KestPlatformString language;
    system_settings_get_value_string(SYSTEM_SETTINGS_KEY_LOCALE_LANGUAGE, language.out());
    elm_language_set(language.get());
    KestContentMgr::getInstance()->loadContentsList(true);
}
