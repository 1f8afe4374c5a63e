#include "KestApp.h"

#include "KestCommon.h"
#include "KestContentMgr.h"
#include "KestContentView.h"
#include "KestLog.h"
#include "KestMainView.h"
#include "KestPaths.h"
#include "KestPlatformString.h"
#include "KestUsageLog.h"

#include <app-assist/WNaviframe.h>
#include <app-assist/WUiTimer.h>
#include <app-assist/WWindow.h>
#include <app_extension.h>
#include <app_resource_manager.h>
#include <system_settings.h>

#include <cstdlib>
#include <vector>

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

unsigned int itemsOn(const Evas_Object* naviframe) {
    Eina_List* items = elm_naviframe_items_get(naviframe);
    const unsigned int count = eina_list_count(items);
    eina_list_free(items);
    return count;
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
    __replaceMainView(nullptr);
}

void KestApp::onPause() {}

void KestApp::onResume() {}

void KestApp::onAppControl(app_control_h request, bool firstLaunch) {
    KEST_BEGIN();
    if (!request) {
        KEST_ERR("request == NULL");
        return;
    }
    std::string type;
    if (!readExtra(request, "LaunchingType", type)) {
        KEST_INFO("app_control_get_extra_data() addNoti Failed");
    }
    if (type == "addNoti") {
        KEST_INFO("Appcontrol case from %s", type.c_str());
        __addKestNotification();
        elm_exit();
    }
    std::string appId;
    if (!readExtra(request, "appID", appId)) {
        KEST_INFO("app_control_get_extra_data() appID Failed");
    }
    if (appId.empty()) {
        if (firstLaunch) {
            __replaceMainView(new KestMainView(true));
            __pushMainView();
        }
        return;
    }
    KEST_INFO("Appcontrol case from %s", appId.c_str());
    std::string page;
    if (!readExtra(request, "page", page)) {
        KEST_INFO("app_control_get_extra_data() page Failed");
    }
    __openMenus(appId, page.empty() ? 1 : std::strtol(page.c_str(), nullptr, 10), firstLaunch);
}

void KestApp::__openMenus(const std::string& appId, long page, bool firstLaunch) {
    // A copy, as what is opened may load the catalogue anew.
    const std::vector<KestContentInfo> contentsList = KestContentMgr::getInstance()->getContentsList();
    for (size_t i = 0; i < contentsList.size(); ++i) {
        if (contentsList[i].appid != appId) {
            continue;
        }
        if (page > 1) {
            --page;
            continue;
        }
        // All further ones of the application are opened too.
        if (!__openMenu(static_cast<int>(i), firstLaunch)) {
            return;
        }
        KestUsageLog::menuRequested(contentsList[i].menuTitle);
    }
}

bool KestApp::__openMenu(int menu, bool firstLaunch) {
    if (!getWindow()) {
        KEST_ERR("getWindow is NULL");
        return false;
    }
    app_assist::WNaviframe* naviframe = __naviframe();
    if (!naviframe) {
        KEST_ERR("WNaviframe is NULL");
        return false;
    }
    const int listIndex = menu + KestContentView::firstListIndex;
    if (firstLaunch) {
        __replaceMainView(new KestMainView(false));
        naviframe->push(new KestContentView(listIndex, true), nullptr, nullptr);
        app_assist::WUiTimer::addIdler(
            [this](app_assist::WView*) {
                __slideMainViewIn();
                return false;
            },
            nullptr, naviframe->getEvasObj());
        return true;
    }
    app_assist::WView* top = naviframe->getTopView();
    if (top && top != mainView) {
        __turnPager(*naviframe, *static_cast<KestContentView*>(top), menu);
    } else {
        naviframe->push(new KestContentView(listIndex, false), nullptr, nullptr);
    }
    return true;
}

void KestApp::__turnPager(app_assist::WNaviframe& naviframe, KestContentView& pager, int menu) {
    if (pager.isOfCatalogue()) {
        pager.showContentsPage(menu);
        return;
    }
    // Its pages stand for menus that have moved meanwhile.
    naviframe.push(new KestContentView(menu + KestContentView::firstListIndex, false), nullptr, nullptr);
    if (!naviframe.isTopView(&pager)) {
        elm_object_item_del(pager.getNaviItem());
    }
}

app_assist::WNaviframe* KestApp::__naviframe() const {
    return getWindow() ? static_cast<app_assist::WNaviframe*>(getWindow()->getBaseUiObject()) : nullptr;
}

void KestApp::__replaceMainView(KestMainView* view) {
    if (mainView && !mainView->getNaviItem()) {
        // Nobody has taken over what was never pushed.
        delete mainView;
    }
    mainView = view;
}

void KestApp::__pushMainView() {
    app_assist::WNaviframe* naviframe = __naviframe();
    const unsigned int before = naviframe ? itemsOn(naviframe->getEvasObj()) : 0;
    if (naviframe) {
        naviframe->push(mainView, nullptr, nullptr);
    } else {
        delete mainView;
    }
    if (!naviframe || itemsOn(naviframe->getEvasObj()) == before) {
        // The naviframe has freed a view that it could not push.
        mainView = nullptr;
        return;
    }
    evas_object_event_callback_add(mainView->getEvasObj(), EVAS_CALLBACK_DEL, __mainViewGone, this);
}

void KestApp::__slideMainViewIn() {
    // Where a request opened several menus, the first of their idlers has done it.
    if (mainView && !mainView->getNaviItem()) {
        __pushMainView();
    }
}

void KestApp::__addKestNotification() {
    KEST_INFO("Inside add_notification");
    notification_h notification = notification_create(NOTIFICATION_TYPE_NOTI);
    if (!notification) {
        KEST_ERR("Fail to notification_create");
        return;
    }
    notification_set_layout(notification, NOTIFICATION_LY_NOTI_EVENT_SINGLE);
    notification_set_text(notification, NOTIFICATION_TEXT_TYPE_TITLE, "Kests",
                          "IDS_KESTS_BODY_KESTS_M_APPLICATION_NAME", NOTIFICATION_VARIABLE_TYPE_NONE);
    notification_set_text(notification, NOTIFICATION_TEXT_TYPE_CONTENT, "Discover useful features here.",
                          "IDS_KESTS_SBODY_DISCOVER_USEFUL_FEATURES_HERE_ABB", NOTIFICATION_VARIABLE_TYPE_NONE);
    __setNotificationImages(notification);
    __setNotificationLaunch(notification);
    notification_set_display_applist(notification, NOTIFICATION_DISPLAY_APP_NOTIFICATION_TRAY |
                                                       NOTIFICATION_DISPLAY_APP_TICKER |
                                                       NOTIFICATION_DISPLAY_APP_INDICATOR);
    const int posted = notification_post(notification);
    if (posted != NOTIFICATION_ERROR_NONE) {
        KEST_ERR("Fail to notification_insert (%d)", posted);
    }
    notification_free(notification);
}

void KestApp::__setNotificationImages(notification_h notification) {
    KestPlatformString path;
    app_resource_manager_get(APP_RESOURCE_TYPE_IMAGE, "images/noti_kest.png", path.out());
    const int indicator = notification_set_image(notification, NOTIFICATION_IMAGE_TYPE_ICON_FOR_INDICATOR, path.get());
    if (indicator != NOTIFICATION_ERROR_NONE) {
        KEST_ERR("Fail to notification_set_image(indicator) : %d", indicator);
    }
    const int quickPanel =
        notification_set_image(notification, NOTIFICATION_IMAGE_TYPE_ICON, kest_paths::notificationIcon);
    if (quickPanel != NOTIFICATION_ERROR_NONE) {
        KEST_ERR("Fail to notification_set_image(quickpanel) : %d", quickPanel);
    }
}

void KestApp::__setNotificationLaunch(notification_h notification) {
    app_control_h launch = nullptr;
    if (app_control_create(&launch) != APP_CONTROL_ERROR_NONE) {
        KEST_ERR("app_control_create error");
        return;
    }
    KEST_INFO("app_control_create success");
    app_control_set_app_id(launch, KEST_APP_ID);
    if (notification_set_launch_option(notification, NOTIFICATION_LAUNCH_OPTION_APP_CONTROL, launch) !=
        NOTIFICATION_ERROR_NONE) {
        // These words are kept for those who search logs for them.
        KEST_ERR("Fail to notification_set_text");
    }
    app_control_destroy(launch);
}

void KestApp::__mainViewGone(void* data, Evas*, Evas_Object*, void*) {
    static_cast<KestApp*>(data)->mainView = nullptr;
}

void KestApp::__languageChanged(app_event_info_h, void*) {
    KestPlatformString language;
    system_settings_get_value_string(SYSTEM_SETTINGS_KEY_LOCALE_LANGUAGE, language.out());
    elm_language_set(language.get());
    KestContentMgr::getInstance()->loadContentsList(true);
}
