// Telling a group of objects from a single one takes a call that EFL still marks as beta.
#define EFL_BETA_API_SUPPORT

#include "DragGuard.h"

#include <Eo.h>

#include <memory>
#include <string_view>

namespace app_assist {

namespace {

constexpr char guardedKey[] = "app_assist::DragGuard";
constexpr char frozenKey[] = "app_assist::DragGuard frozen";

template <typename Visit>
void forEachInside(Evas_Object* object, std::string_view type, const Visit& visit) {
    if (!efl_isa(object, EFL_CANVAS_GROUP_CLASS))
        return;
    Eina_List* members = evas_object_smart_members_get(object);
    void* each = nullptr;
    EINA_LIST_FREE(members, each) {
        auto* member = static_cast<Evas_Object*>(each);
        if (elm_object_widget_check(member) && type == elm_object_widget_type_get(member))
            visit(member);
        forEachInside(member, type, visit);
    }
}

/// What in an entry moves the cursor. The entry itself must not be frozen: it would not even hear of its own end.
Evas_Object* textOf(const Evas_Object* entry) {
    return const_cast<Evas_Object*>(edje_object_part_object_get(elm_layout_edje_get(entry), "elm.text"));
}

}  // namespace

void DragGuard::attach(Evas_Object* scroller) {
    if (evas_object_data_get(scroller, guardedKey))
        return;
    evas_object_data_set(scroller, guardedKey, scroller);
    std::unique_ptr<DragGuard> guard(new DragGuard(scroller));
    evas_object_smart_callback_add(
        scroller, "scroll,drag,start",
        [](void* self, Evas_Object*, void*) { static_cast<DragGuard*>(self)->dragBegins(); }, guard.get());
    evas_object_smart_callback_add(
        scroller, "scroll,drag,stop",
        [](void* self, Evas_Object*, void*) { static_cast<DragGuard*>(self)->dragEnds(); }, guard.get());
    // Pages are filled late, so what lies inside is looked for when a finger comes down.
    evas_object_event_callback_add(
        scroller, EVAS_CALLBACK_MOUSE_DOWN,
        [](void*, Evas*, Evas_Object* object, void*) { forEachInside(object, "Elm_Scroller", DragGuard::attach); },
        nullptr);
    evas_object_event_callback_add(
        scroller, EVAS_CALLBACK_FREE,
        [](void* data, Evas*, Evas_Object*, void*) {
            const std::unique_ptr<DragGuard> self(static_cast<DragGuard*>(data));
            if (self->job_)
                ecore_job_del(self->job_);
        },
        guard.get());
    // The scroller has it from now on.
    static_cast<void>(guard.release());
}

void DragGuard::dragBegins() {
    forEachInside(scroller_, "Elm_Entry", [](Evas_Object* entry) {
        Evas_Object* text = textOf(entry);
        if (!text || evas_object_freeze_events_get(text))
            return;
        evas_object_data_set(text, frozenKey, text);
        evas_object_freeze_events_set(text, EINA_TRUE);
    });
}

// Not at once: the text would get the very lifting of the finger that it must not see.
void DragGuard::dragEnds() {
    if (!job_)
        job_ = ecore_job_add([](void* self) { static_cast<DragGuard*>(self)->release(); }, this);
}

void DragGuard::release() {
    job_ = nullptr;
    forEachInside(scroller_, "Elm_Entry", [](Evas_Object* entry) {
        Evas_Object* text = textOf(entry);
        if (text && evas_object_data_del(text, frozenKey))
            evas_object_freeze_events_set(text, EINA_FALSE);
    });
}

}  // namespace app_assist
