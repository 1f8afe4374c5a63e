#pragma once

#include "KestApp.h"

#include "kest/KestDevice.h"
#include "ui/RunningApp.h"
#include "ui/UiTest.h"

#include <app-assist/WNaviframe.h>
#include <app-assist/WView.h>

#include <optional>
#include <string>
#include <vector>

/// The application, run in memory on the test's own clock and touched with a finger, on a device whose catalogue the
/// test writes.
class KestUiTest : public test_ui::UiTest, protected KestDevice {
protected:
    /// The application of the test, with what the framework asks of it within reach.
    struct App : KestApp {
        bool takesRequests = true;  ///< false: launch requests come to nothing, so no view is pushed

        void onAppControl(app_control_h request, bool firstLaunch) override {
            if (takesRequests)
                KestApp::onAppControl(request, firstLaunch);
        }
        using KestApp::onCreate;
        using KestApp::onPause;
        using KestApp::onResume;
        using KestApp::onTerminate;
    };

    KestUiTest();

    /// Starts the application and waits until its first screen stands. `words` are extras of the launch request.
    void start(const std::vector<std::string>& words = {});
    /// Lets what a change sets off happen: transitions, jobs, frames.
    static void settle() { test_ui::runFor(0.5); }

    test_ui::RunningApp& running() { return *running_; }
    test_ui::Screen& screen() { return running().screen(); }
    app_assist::WNaviframe& naviframe();
    /// The class of the view on the top of the naviframe; "" when there is none.
    std::string topView();

    void setLanguage(const std::string& language);

    /// The application's lines in the log since the last call (or its start).
    std::vector<kest_log::Line> newLog();

    App app_;
    std::optional<test_ui::RunningApp> running_;

private:
    std::size_t logRead_ = 0;
};
