#pragma once

#include "ui/Screen.h"

#include <app-assist/WApp.h>

#include <memory>
#include <optional>
#include <string>
#include <vector>

namespace app_assist {
class Runtime;
}

namespace test_ui {

/// An application of the framework that runs inside the test, on the test's clock: runFor() is its main loop.
/// Needs a Toolkit and a device before it; ends the application when destroyed.
class RunningApp {
public:
    /// Begins as WApp::start() does, with these KEY=VALUE words, as far as the main loop.
    explicit RunningApp(app_assist::WApp& app, std::vector<std::string> words = {});
    ~RunningApp();
    RunningApp(const RunningApp&) = delete;
    RunningApp& operator=(const RunningApp&) = delete;

    /// The exit status where the application ended before its main loop.
    std::optional<int> status() const { return status_; }
    /// Its window; null when there is none.
    Evas_Object* window() const;
    /// The finger, keys and picture of the window.
    Screen& screen();

    /// Ends it now.
    void end();

private:
    app_assist::WApp& app_;
    std::vector<std::string> words_;
    std::vector<char*> argv_;
    std::unique_ptr<app_assist::Runtime> runtime_;
    std::optional<int> status_;
    std::unique_ptr<Screen> screen_;
};

}  // namespace test_ui
