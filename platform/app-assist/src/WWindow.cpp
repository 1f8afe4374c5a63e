#include "app-assist/WWindow.h"

#include "DisplayWindow.h"
#include "Guarded.h"
#include "app-assist/WApp.h"
#include "app-assist/WUIObject.h"

#include <utility>

namespace app_assist {

WWindow::WWindow(const char* name, Elm_Win_Type type) : name_(name ? name : ""), type_(type) {}

WWindow::~WWindow() {
    if (window_) {
        Evas_Object* window = window_;
        // What lies in the window goes with it and must find its framework objects; nobody is told of the end.
        evas_object_event_callback_del_full(window, EVAS_CALLBACK_DEL, evasObjectGoes, this);
        window_ = nullptr;
        evas_object_del(window);
    }
    base_.reset();
}

void WWindow::setOnCreateWin(std::function<Evas_Object*()> onCreateWin) {
    onCreateWin_ = std::move(onCreateWin);
}

void WWindow::create() {
    window_ = onCreateWin_ ? onCreateWin_() : elm_win_add(nullptr, getName(), type_);
    if (!window_) {
        dlog_print(DLOG_ERROR, logTag, "the window %s could not be made", getName());
        return;
    }
    fitToDisplay(window_);
    evas_object_event_callback_add(window_, EVAS_CALLBACK_DEL, evasObjectGoes, this);
    evas_object_event_callback_add(window_, EVAS_CALLBACK_RESIZE, resized, this);
    evas_object_smart_callback_add(
        window_, "delete,request", [](void*, Evas_Object*, void*) { elm_exit(); }, nullptr);
    if (!onCreateWin_)
        evas_object_show(window_);
}

void WWindow::evasObjectGoes(void* data, Evas*, Evas_Object*, void*) {
    static_cast<WWindow*>(data)->window_ = nullptr;
    elm_exit();
}

void WWindow::resized(void* data, Evas*, Evas_Object*, void*) {
    static_cast<WWindow*>(data)->fitBase();
}

void WWindow::attachBaseUiObject(WUIObject* object, void* viewParam) {
    base_.reset(object);
    if (!object)
        return;
    object->window_ = this;
    if (!window_)
        return;
    if (!object->create(window_, viewParam)) {
        dlog_print(DLOG_ERROR, logTag, "the base of the window %s could not be made", getName());
        return;
    }
    fitBase();
    evas_object_show(object->getEvasObj());
}

/// By hand, because what EFL resizes with a window makes the window as large as its contents want to be.
void WWindow::fitBase() {
    Evas_Object* base = base_ ? base_->getEvasObj() : nullptr;
    if (!base || !window_)
        return;
    int width = 0, height = 0;
    evas_object_geometry_get(window_, nullptr, nullptr, &width, &height);
    evas_object_move(base, 0, 0);
    evas_object_resize(base, width, height);
}

}  // namespace app_assist
