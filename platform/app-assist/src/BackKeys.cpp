#include "BackKeys.h"

#include "Guarded.h"

#include <utility>

namespace app_assist {

namespace {

constexpr const char* names[] = {"XF86Back", "Escape", "BackSpace"};

}  // namespace

BackKeys::BackKeys(Evas* canvas, std::function<void()> pressed)
    : pressed_(std::move(pressed)), owner_(evas_object_rectangle_add(canvas)) {
    for (const char* name : names) {
        if (!evas_object_key_grab(owner_, name, 0, 0, EINA_TRUE))
            dlog_print(DLOG_WARN, logTag, "the key %s is taken by somebody else", name);
    }
    evas_object_event_callback_add(owner_, EVAS_CALLBACK_KEY_DOWN, keyDown, this);
    evas_object_event_callback_add(owner_, EVAS_CALLBACK_DEL, ownerGone, this);
}

BackKeys::~BackKeys() {
    if (!owner_)
        return;
    evas_object_event_callback_del_full(owner_, EVAS_CALLBACK_DEL, ownerGone, this);
    evas_object_del(owner_);
}

void BackKeys::keyDown(void* data, Evas*, Evas_Object*, void*) {
    auto* keys = static_cast<BackKeys*>(data);
    guarded("the back key", [keys] { keys->pressed_(); });
}

void BackKeys::ownerGone(void* data, Evas*, Evas_Object*, void*) {
    static_cast<BackKeys*>(data)->owner_ = nullptr;
}

}  // namespace app_assist
