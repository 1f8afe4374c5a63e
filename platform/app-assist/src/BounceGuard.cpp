#include "BounceGuard.h"

#include <memory>

namespace app_assist {

void BounceGuard::attach(Evas_Object* scroller) {
    std::unique_ptr<BounceGuard> guard(new BounceGuard(scroller));
    const auto onSmart = [&](const char* event, Evas_Smart_Cb callback) {
        evas_object_smart_callback_add(scroller, event, callback, guard.get());
    };
    const auto onEvas = [&](Evas_Callback_Type event, Evas_Object_Event_Cb callback) {
        evas_object_event_callback_add(scroller, event, callback, guard.get());
    };
    onSmart("scroll,anim,start",
            [](void* self, Evas_Object*, void*) { static_cast<BounceGuard*>(self)->moving_ = true; });
    onSmart("scroll,anim,stop", [](void* self, Evas_Object*, void*) { static_cast<BounceGuard*>(self)->stopped(); });
    onEvas(EVAS_CALLBACK_MOUSE_DOWN,
           [](void* self, Evas*, Evas_Object*, void*) { static_cast<BounceGuard*>(self)->held_ = true; });
    onEvas(EVAS_CALLBACK_MOUSE_UP,
           [](void* self, Evas*, Evas_Object*, void*) { static_cast<BounceGuard*>(self)->held_ = false; });
    onEvas(EVAS_CALLBACK_FREE, [](void* data, Evas*, Evas_Object*, void*) {
        const std::unique_ptr<BounceGuard> self(static_cast<BounceGuard*>(data));
        if (self->job_)
            ecore_job_del(self->job_);
    });
    // The scroller has it from now on.
    static_cast<void>(guard.release());
}

// Not at once: EFL takes its animation up again when the callback has returned.
void BounceGuard::stopped() {
    moving_ = false;
    if (!job_)
        job_ = ecore_job_add([](void* self) { static_cast<BounceGuard*>(self)->stayHere(); }, this);
}

void BounceGuard::stayHere() {
    job_ = nullptr;
    // A finger or a new animation moves it again, rightly.
    if (moving_ || held_)
        return;
    int x = 0, y = 0, width = 0, height = 0;
    elm_scroller_region_get(scroller_, &x, &y, &width, &height);
    elm_scroller_region_show(scroller_, x, y, width, height);
}

}  // namespace app_assist
