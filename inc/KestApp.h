#pragma once

#include <app-assist/WApp.h>
#include <app-assist/WAppEventHandler.h>
#include <ui_extension.h>

class KestMainView;

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
    static void __languageChanged(app_event_info_h info, void* data);

    app_assist::WAppEventHandler eventHandler;
    uxt_color_table_h colorTable;
    uxt_font_table_h fontTable;
    /// The naviframe owns the view.
    KestMainView* mainView;
};
