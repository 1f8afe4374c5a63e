#include "ScrollWatch.h"

#include "Objects.h"

#include <Elementary.h>
#include <Eo.h>

#include <algorithm>

namespace remote_control {

namespace {

constexpr char started[] = "scroll,anim,start";
constexpr char stopped[] = "scroll,anim,stop";

}  // namespace

ScrollWatch::ScrollWatch(Evas* canvas) {
    visitWidgets(canvas, [this](Evas_Object* widget) {
        Watched& watched = widgets_.emplace_back();
        // Told by the object itself: a widget within one that is deleted does not always say so.
        efl_wref_add(widget, &watched.widget);
        evas_object_smart_callback_add(widget, started, onStart, &watched);
        evas_object_smart_callback_add(widget, stopped, onStop, &watched);
    });
}

ScrollWatch::~ScrollWatch() {
    for (Watched& watched : widgets_) {
        if (watched.widget) {
            evas_object_smart_callback_del_full(watched.widget, started, onStart, &watched);
            evas_object_smart_callback_del_full(watched.widget, stopped, onStop, &watched);
            efl_wref_del(watched.widget, &watched.widget);
        }
    }
}

bool ScrollWatch::isScrolling() const {
    const double now = ecore_loop_time_get();
    return std::any_of(widgets_.begin(), widgets_.end(), [now](const Watched& watched) {
        return watched.widget && (watched.scrolling || now < watched.momentumEnd);
    });
}

void ScrollWatch::onStart(void* data, Evas_Object*, void*) {
    auto* watched = static_cast<Watched*>(data);
    watched->scrolling = true;
    // At the end of a list the toolkit says that the scrolling has stopped, and keeps its momentum for this time.
    watched->momentumEnd = ecore_loop_time_get() + elm_config_scroll_thumbscroll_friction_get();
}

void ScrollWatch::onStop(void* data, Evas_Object*, void*) {
    static_cast<Watched*>(data)->scrolling = false;
}

}  // namespace remote_control
