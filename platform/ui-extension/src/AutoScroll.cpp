// EFL has a switch for the whole process only (elm_config_focus_autoscroll_mode_set), and its scrollers do not heed it:
// each listens to its own focus changes and brings the focused child in. So one scroller is told apart by overriding
// that one operation, for as long as a focus change is being told.
#define EFL_EO_API_SUPPORT 1
#define EFL_BETA_API_SUPPORT 1

#include "AutoScroll.h"

#include <Elementary.h>
#include <elm_interface_scrollable.eo.h>

#include <stdexcept>

// Declared in a header of EFL's that does not compile on its own.
extern "C" const Efl_Event_Description _EFL_UI_FOCUS_MANAGER_EVENT_MANAGER_FOCUS_CHANGED;

namespace uxt {
namespace {

constexpr char offKey[] = "uxt.auto-scroll-off";
constexpr char changingKey[] = "uxt.focus-changing";
const Efl_Event_Description* const focusChanged = &_EFL_UI_FOCUS_MANAGER_EVENT_MANAGER_FOCUS_CHANGED;

void bringIn(Eo* scroller, void*, int x, int y, int width, int height) {
    if (!evas_object_data_get(scroller, changingKey))
        elm_interface_scrollable_region_bring_in(efl_super(scroller, EFL_OBJECT_OVERRIDE_CLASS), x, y, width, height);
}

void focusWillBeTold(void*, const Efl_Event* event) {
    evas_object_data_set(event->object, changingKey, event->object);
}

void focusWasTold(void*, const Efl_Event* event) {
    evas_object_data_del(event->object, changingKey);
}

void switchOff(Evas_Object* scroller) {
    EFL_OPS_DEFINE(operations, EFL_OBJECT_OP_FUNC(reinterpret_cast<void*>(elm_interface_scrollable_region_bring_in),
                                                  reinterpret_cast<void*>(bringIn)));
    if (!efl_object_override(scroller, &operations))
        throw std::runtime_error("EFL does not let the scroller be changed");
    efl_event_callback_priority_add(scroller, focusChanged, EFL_CALLBACK_PRIORITY_BEFORE, focusWillBeTold, nullptr);
    efl_event_callback_priority_add(scroller, focusChanged, EFL_CALLBACK_PRIORITY_AFTER, focusWasTold, nullptr);
    evas_object_data_set(scroller, offKey, scroller);
}

void switchOn(Evas_Object* scroller) {
    efl_event_callback_del(scroller, focusChanged, focusWillBeTold, nullptr);
    efl_event_callback_del(scroller, focusChanged, focusWasTold, nullptr);
    evas_object_data_del(scroller, changingKey);
    evas_object_data_del(scroller, offKey);
    efl_object_override(scroller, nullptr);
}

}  // namespace

void setAutoScroll(Evas_Object* scroller, bool enabled) {
    if (!scroller || !efl_isa(scroller, ELM_INTERFACE_SCROLLABLE_MIXIN))
        throw std::invalid_argument("the object does not scroll");
    const bool isEnabled = !evas_object_data_get(scroller, offKey);
    if (enabled != isEnabled)
        enabled ? switchOn(scroller) : switchOff(scroller);
}

}  // namespace uxt
