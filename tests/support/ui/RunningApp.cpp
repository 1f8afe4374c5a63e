#include "ui/RunningApp.h"

#include "ui/Clock.h"

#include <Runtime.h>
#include <app-assist/WWindow.h>

#include <utility>

namespace test_ui {

using app_assist::Toolkit;

RunningApp::RunningApp(app_assist::WApp& app, std::vector<std::string> words)
    : app_(app), words_(std::move(words)),
      runtime_(std::make_unique<app_assist::Runtime>(app, Toolkit::Messages::AsTheyAre)) {
    words_.insert(words_.begin(), "app");
    for (std::string& word : words_)
        argv_.push_back(word.data());
    argv_.push_back(nullptr);
    status_ = runtime_->begin(static_cast<int>(words_.size()), argv_.data());
    clock::driveAnimations();
}

RunningApp::~RunningApp() = default;

Evas_Object* RunningApp::window() const {
    return app_.getWindow() ? app_.getWindow()->getEvasObj() : nullptr;
}

Screen& RunningApp::screen() {
    if (!screen_)
        screen_ = std::make_unique<Screen>(window());
    return *screen_;
}

void RunningApp::end() {
    runtime_.reset();
}

}  // namespace test_ui
