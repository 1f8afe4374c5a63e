#include "Original.h"
#include "efl-answers/RefusedPop.h"

#include <Elementary.h>

namespace {

using efl_answers::refusedPopKey;

constexpr char askedKey[] = "efl_answers::asked";

/// What an item's owner has to say to its being popped.
struct PopCallback {
    Elm_Naviframe_Item_Pop_Cb function;
    void* data;
};

Eina_Bool ask(void* callback, Elm_Object_Item* item) {
    const PopCallback owner = *static_cast<PopCallback*>(callback);
    evas_object_data_set(elm_object_item_widget_get(item), askedKey, item);
    return owner.function(owner.data, item);
}

void itemGoes(void* callback, const Efl_Event*) {
    delete static_cast<PopCallback*>(callback);
}

Elm_Object_Item* pop(Evas_Object* naviframe) {
    static const auto original = efl_answers::original<Elm_Object_Item*(Evas_Object*)>("elm_naviframe_item_pop");
    return original ? original(naviframe) : nullptr;
}

void popWhatWasRefused(void*, Evas_Object* naviframe, void*) {
    const void* refused = evas_object_data_del(naviframe, refusedPopKey);
    evas_object_smart_callback_del(naviframe, "transition,finished", popWhatWasRefused);
    if (elm_naviframe_top_item_get(naviframe) == refused)
        pop(naviframe);
}

}  // namespace

/// Only who hears that an item was asked can tell an item that keeps itself from a pop that EFL refused.
extern "C" void elm_naviframe_item_pop_cb_set(Elm_Object_Item* item, Elm_Naviframe_Item_Pop_Cb function, void* data) {
    static const auto set = efl_answers::original<void(Elm_Object_Item*, Elm_Naviframe_Item_Pop_Cb, void*)>(
        "elm_naviframe_item_pop_cb_set");
    if (!set)
        return;
    if (!function) {
        set(item, nullptr, nullptr);
        return;
    }
    auto* callback = new PopCallback{function, data};
    efl_event_callback_add(item, EFL_EVENT_DEL, itemGoes, callback);
    set(item, ask, callback);
}

/// EFL does nothing, and says nothing, while the top item is still moving in. A view that has to close because the
/// device has changed would stay open for good; so it is popped when it has come to rest. An item that was asked and
/// keeps itself stays.
extern "C" Elm_Object_Item* elm_naviframe_item_pop(Evas_Object* naviframe) {
    const Elm_Object_Item* top = elm_naviframe_top_item_get(naviframe);
    evas_object_data_del(naviframe, askedKey);
    Elm_Object_Item* popped = pop(naviframe);
    const bool wasAsked = evas_object_data_del(naviframe, askedKey) == top;
    const bool refused = top && !wasAsked && elm_naviframe_top_item_get(naviframe) == top;
    if (refused && !evas_object_data_get(naviframe, refusedPopKey)) {
        evas_object_data_set(naviframe, refusedPopKey, top);
        evas_object_smart_callback_add(naviframe, "transition,finished", popWhatWasRefused, nullptr);
    }
    return popped;
}
