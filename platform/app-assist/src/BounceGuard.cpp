#include "BounceGuard.h"

#include <Eo.h>

#include <memory>

namespace app_assist {

BounceGuard& BounceGuard::attach(Evas_Object* scroller) {
    std::unique_ptr<BounceGuard> guard(new BounceGuard(scroller));
    const auto onSmart = [&](const char* event, Evas_Smart_Cb callback) {
        evas_object_smart_callback_priority_add(scroller, event, EVAS_CALLBACK_PRIORITY_BEFORE, callback, guard.get());
    };
    const auto onEvas = [&](Evas_Callback_Type event, Evas_Object_Event_Cb callback) {
        evas_object_event_callback_add(scroller, event, callback, guard.get());
    };
    onSmart("scroll,anim,start", [](void* self, Evas_Object*, void*) { static_cast<BounceGuard*>(self)->started(); });
    onSmart("scroll,anim,stop", [](void* self, Evas_Object*, void*) { static_cast<BounceGuard*>(self)->stopped(); });
    // Its pages go after this, one by one, and the focus with them, which would still move it.
    onEvas(EVAS_CALLBACK_DEL,
           [](void* self, Evas*, Evas_Object*, void*) { static_cast<BounceGuard*>(self)->going_ = true; });
    onEvas(EVAS_CALLBACK_FREE, [](void* data, Evas*, Evas_Object*, void*) {
        const std::unique_ptr<BounceGuard> self(static_cast<BounceGuard*>(data));
        if (self->job_)
            ecore_job_del(self->job_);
    });
    // The scroller has it from now on.
    return *guard.release();
}

void BounceGuard::hush() const {
    // The listeners that come after this one do not hear what it hears now.
    efl_event_callback_stop(scroller_);
}

void BounceGuard::redirect(const std::function<void()>& change) {
    redirects_ = moving_;
    change();
    redirects_ = false;
}

void BounceGuard::started() {
    if (going_ || redirects_)
        hush();
    else
        moving_ = true;
}

void BounceGuard::stopped() {
    if (redirects_) {
        hush();
        return;
    }
    if (moving_ && !going_) {
        moving_ = false;
        return;
    }
    hush();
    // Not at once: EFL takes its animation up again when the callback has returned.
    if (!job_)
        job_ = ecore_job_add([](void* self) { static_cast<BounceGuard*>(self)->stayHere(); }, this);
}

void BounceGuard::stayHere() {
    job_ = nullptr;
    // A finger or a new movement has ended the animation, and moves the scroller rightly.
    if (moving_ || evas_pointer_button_down_mask_get(evas_object_evas_get(scroller_)))
        return;
    int x = 0, y = 0, width = 0, height = 0;
    elm_scroller_region_get(scroller_, &x, &y, &width, &height);
    elm_scroller_region_show(scroller_, x, y, width, height);
}

}  // namespace app_assist
