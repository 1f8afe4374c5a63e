#include "ScrollWatch.h"

#include "Objects.h"

#include <Elementary.h>

namespace remote_control {

namespace {

constexpr char started[] = "scroll,anim,start";
constexpr char stopped[] = "scroll,anim,stop";

}  // namespace

ScrollWatch::ScrollWatch(Evas* canvas) {
    visitWidgets(canvas, [this](Evas_Object* widget) { watch(widget); });
}

ScrollWatch::~ScrollWatch() {
    while (!watched_.empty()) {
        forget(*watched_.begin());
    }
}

bool ScrollWatch::isScrolling() const {
    return !watched_.empty() && (!scrolling_.empty() || ecore_loop_time_get() < momentumEnd_);
}

void ScrollWatch::watch(Evas_Object* widget) {
    evas_object_smart_callback_add(widget, started, onStart, this);
    evas_object_smart_callback_add(widget, stopped, onStop, this);
    evas_object_event_callback_add(widget, EVAS_CALLBACK_DEL, onDelete, this);
    watched_.insert(widget);
}

void ScrollWatch::forget(Evas_Object* widget) {
    evas_object_smart_callback_del_full(widget, started, onStart, this);
    evas_object_smart_callback_del_full(widget, stopped, onStop, this);
    evas_object_event_callback_del_full(widget, EVAS_CALLBACK_DEL, onDelete, this);
    watched_.erase(widget);
    if (scrolling_.erase(widget) > 0 && scrolling_.empty()) {
        momentumEnd_ = 0;
    }
}

void ScrollWatch::onStart(void* data, Evas_Object* widget, void*) {
    auto* self = static_cast<ScrollWatch*>(data);
    self->scrolling_.insert(widget);
    // At the end of a list the toolkit says that the scrolling has stopped, and keeps its momentum for this time.
    self->momentumEnd_ = ecore_loop_time_get() + elm_config_scroll_thumbscroll_friction_get();
}

void ScrollWatch::onStop(void* data, Evas_Object* widget, void*) {
    static_cast<ScrollWatch*>(data)->scrolling_.erase(widget);
}

void ScrollWatch::onDelete(void* data, Evas*, Evas_Object* widget, void*) {
    static_cast<ScrollWatch*>(data)->forget(widget);
}

}  // namespace remote_control
