#include "Original.h"

#include <Elementary.h>

#include <string_view>

// A finger does nothing to a text that is only to be read, but tap its links and scroll what it lies in. EFL has it
// take the focus, and moves its cursor to where the finger lifts; either has the scrollers around it show the place,
// which takes a long text back to its beginning, snaps a page back that was about to turn and stops what still moves.

namespace {

bool isToRead(const Evas_Object* object) {
    const char* type = object ? elm_object_widget_type_get(object) : nullptr;
    return type && std::string_view("Elm_Entry") == type && !elm_entry_editable_get(object);
}

}  // namespace

/// Only what can be written in has a use for the focus.
extern "C" void elm_entry_editable_set(Evas_Object* entry, Eina_Bool editable) {
    static const auto set = efl_answers::original<void(Evas_Object*, Eina_Bool)>("elm_entry_editable_set");
    if (!set)
        return;
    set(entry, editable);
    elm_object_focus_allow_set(entry, editable);
}

/// Not in EFL's public headers: how a widget has the scrollers around it show a place of it, such as its cursor.
extern "C" void elm_widget_show_region_set(Evas_Object* widget, Eina_Rect place, Eina_Bool again) {
    static const auto set =
        efl_answers::original<void(Evas_Object*, Eina_Rect, Eina_Bool)>("elm_widget_show_region_set");
    if (set && (!isToRead(widget) || elm_entry_scrollable_get(widget)))
        set(widget, place, again);
}
