#include "app-assist/WApp.h"

#include "Guarded.h"
#include "Runtime.h"
#include "app-assist/WWindow.h"

#include <utility>

namespace app_assist {

namespace {

WApp* instance = nullptr;

}  // namespace

WApp::WApp() {
    instance = this;
}

WApp::~WApp() {
    if (instance == this)
        instance = nullptr;
}

WApp* WApp::getInstance() {
    return instance;
}

int WApp::start(int argc, char** argv) {
    Runtime runtime(*this);
    if (const auto status = runtime.begin(argc, argv))
        return *status;
    elm_run();
    return 0;
}

void WApp::attachWindow(WWindow* window) {
    window_.reset(window);
    if (!window)
        return;
    window->create();
    if (!window->getEvasObj())
        return;
    evas_object_smart_callback_add(
        window->getEvasObj(), "iconified",
        [](void* app, Evas_Object*, void*) { static_cast<WApp*>(app)->setInSight(false); }, this);
    evas_object_smart_callback_add(
        window->getEvasObj(), "normal",
        [](void* app, Evas_Object*, void*) { static_cast<WApp*>(app)->setInSight(true); }, this);
}

void WApp::beginSight() {
    watchesWindow_ = true;
    setInSight(true);
}

void WApp::endSight() {
    setInSight(false);
    watchesWindow_ = false;
}

void WApp::setInSight(bool inSight) {
    if (!watchesWindow_ || std::exchange(inSight_, inSight) == inSight)
        return;
    guarded("onResume or onPause", [&] { inSight ? onResume() : onPause(); });
}

WWindow* WApp::getWindow() const {
    return window_.get();
}

void WApp::onStart(int, char**) {}

bool WApp::onCreate() {
    return true;
}

void WApp::onTerminate() {}

void WApp::onPause() {}

void WApp::onResume() {}

void WApp::onAppControl(app_control_h, bool) {}

}  // namespace app_assist
