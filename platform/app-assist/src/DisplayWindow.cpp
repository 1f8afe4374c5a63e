#include "DisplayWindow.h"

#include <app_extension.h>
#include <device/Device.h>

#include <Ecore_Evas.h>

#include <utility>

namespace app_assist {

namespace {

PreinitializedWindow* currentWindow = nullptr;

/// Under this name a window knows the object that gives it its size.
constexpr char sizeKey[] = "app_assist display size";

}  // namespace

// A window takes its limits from what it resizes along, so it gets something of one size that never draws.
void fitToDisplay(Evas_Object* window) {
    const device::Screen& screen = device::Device::current().screen();
    auto* size = static_cast<Evas_Object*>(evas_object_data_get(window, sizeKey));
    if (!size) {
        size = evas_object_rectangle_add(evas_object_evas_get(window));
        evas_object_color_set(size, 0, 0, 0, 0);
        evas_object_pass_events_set(size, EINA_TRUE);
        elm_win_resize_object_add(window, size);
        evas_object_data_set(window, sizeKey, size);
    }
    evas_object_size_hint_min_set(size, screen.width, screen.height);
    evas_object_size_hint_max_set(size, screen.width, screen.height);
    evas_object_resize(window, screen.width, screen.height);
}

PreinitializedWindow::PreinitializedWindow()
    : window_(elm_win_add(nullptr, device::Device::current().application().id.c_str(), ELM_WIN_BASIC)) {
    currentWindow = this;
    if (!window_)
        return;
    evas_object_event_callback_add(window_, EVAS_CALLBACK_DEL, deleted, this);
    fitToDisplay(window_);
}

PreinitializedWindow::~PreinitializedWindow() {
    currentWindow = nullptr;
    if (Evas_Object* window = take(nullptr))
        evas_object_del(window);
}

PreinitializedWindow* PreinitializedWindow::current() {
    return currentWindow;
}

Evas_Object* PreinitializedWindow::take(const char* name) {
    Evas_Object* window = std::exchange(window_, nullptr);
    if (!window)
        return nullptr;
    evas_object_event_callback_del_full(window, EVAS_CALLBACK_DEL, deleted, this);
    if (name)
        ecore_evas_name_class_set(ecore_evas_ecore_evas_get(evas_object_evas_get(window)), name, elm_app_name_get());
    return window;
}

void PreinitializedWindow::deleted(void* self, Evas*, Evas_Object*, void*) {
    static_cast<PreinitializedWindow*>(self)->window_ = nullptr;
}

}  // namespace app_assist

extern "C" void* app_get_preinitialized_window(const char* win_name) {
    auto* ahead = app_assist::PreinitializedWindow::current();
    return ahead ? ahead->take(win_name) : nullptr;
}
