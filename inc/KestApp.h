#pragma once

#include <app-assist/WApp.h>
#include <app-assist/WAppEventHandler.h>
#include <notification.h>
#include <ui_extension.h>

#include <string>

class KestContentView;
class KestMainView;

namespace app_assist {
class WNaviframe;
}

/// The application object: makes the window and the naviframe, follows the display language, and decides what a
/// launch request shows.
class KestApp : public app_assist::WApp {
public:
    KestApp();
    ~KestApp() override;

protected:
    bool onCreate() override;
    void onTerminate() override;
    void onPause() override;
    void onResume() override;
    void onAppControl(app_control_h request, bool firstLaunch) override;

private:
    /// Opens the menus of that application from its `page`th on, counted from 1.
    void __openMenus(const std::string& appId, long page, bool firstLaunch);
    /// False when there is nothing to open it on.
    bool __openMenu(int menu, bool firstLaunch);
    static void __turnPager(app_assist::WNaviframe& naviframe, KestContentView& pager, int menu);
    /// Null without a window, or when the window is closed.
    app_assist::WNaviframe* __naviframe() const;
    /// Frees a list that never came onto the naviframe.
    void __replaceMainView(KestMainView* view);
    void __pushMainView();
    void __slideMainViewIn();

    /// Posts the notification that invites the user into the application.
    static void __addKestNotification();
    static void __setNotificationImages(notification_h notification);
    static void __setNotificationLaunch(notification_h notification);

    static void __languageChanged(app_event_info_h info, void* data);
    static void __mainViewGone(void* data, Evas* evas, Evas_Object* obj, void* event_info);

    app_assist::WAppEventHandler eventHandler;
    uxt_color_table_h colorTable;
    uxt_font_table_h fontTable;
    /// The naviframe owns the view once it is pushed. Null when it is gone.
    KestMainView* mainView;
};
