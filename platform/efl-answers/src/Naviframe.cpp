#include "Original.h"

#include <Elementary.h>

namespace {

constexpr char refusedKey[] = "efl_answers::refusedPop";

Elm_Object_Item* pop(Evas_Object* naviframe) {
    static const auto original = efl_answers::original<Elm_Object_Item*(Evas_Object*)>("elm_naviframe_item_pop");
    return original ? original(naviframe) : nullptr;
}

void popWhatWasRefused(void*, Evas_Object* naviframe, void*) {
    const void* refused = evas_object_data_del(naviframe, refusedKey);
    evas_object_smart_callback_del(naviframe, "transition,finished", popWhatWasRefused);
    if (elm_naviframe_top_item_get(naviframe) == refused)
        pop(naviframe);
}

}  // namespace

/// EFL does nothing, and says nothing, while the top item is still moving in. A view that has to close because the
/// device has changed would stay open for good; so it is popped when it has come to rest.
extern "C" Elm_Object_Item* elm_naviframe_item_pop(Evas_Object* naviframe) {
    const Elm_Object_Item* top = elm_naviframe_top_item_get(naviframe);
    Elm_Object_Item* popped = pop(naviframe);
    const bool refused = top && elm_naviframe_top_item_get(naviframe) == top;
    if (refused && !evas_object_data_get(naviframe, refusedKey)) {
        evas_object_data_set(naviframe, refusedKey, top);
        evas_object_smart_callback_add(naviframe, "transition,finished", popWhatWasRefused, nullptr);
    }
    return popped;
}
