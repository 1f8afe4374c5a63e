#include "ui/Undrawn.h"

#include <Ecore_Evas.h>

namespace test_ui {

Undrawn::Undrawn(Evas_Object* window) : window_(window), idleEnterer_(ecore_idle_enterer_add(beforeIdle, this)) {
    ecore_evas_manual_render_set(ecore_evas_ecore_evas_get(evas_object_evas_get(window_)), EINA_TRUE);
    evas_object_event_callback_add(window_, EVAS_CALLBACK_DEL, windowGone, this);
}

Undrawn::~Undrawn() {
    if (window_)
        evas_object_event_callback_del_full(window_, EVAS_CALLBACK_DEL, windowGone, this);
    ecore_idle_enterer_del(idleEnterer_);
}

Eina_Bool Undrawn::beforeIdle(void* data) {
    auto* self = static_cast<Undrawn*>(data);
    ++self->turns_;
    if (self->window_)
        evas_norender(evas_object_evas_get(self->window_));
    return ECORE_CALLBACK_RENEW;
}

void Undrawn::windowGone(void* self, Evas*, Evas_Object*, void*) {
    static_cast<Undrawn*>(self)->window_ = nullptr;
}

}  // namespace test_ui
