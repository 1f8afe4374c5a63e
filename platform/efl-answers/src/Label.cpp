#include "Original.h"
#include "TextPicture.h"

#include <Elementary.h>

#include <string>

namespace {

Evas_Object* picture(void*, Evas_Object* label, const char*, const char* href) {
    Evas* canvas = evas_object_evas_get(label);
    // EFL goes on with what it gets here without a look at it.
    Evas_Object* found = efl_answers::textPicture(canvas, href);
    return found ? found : efl_answers::emptyPicture(canvas);
}

/// Setting the text is what has a label measured.
void measure(void*, Evas_Object* label, void*) {
    const char* text = elm_object_text_get(label);
    if (text)
        elm_object_text_set(label, std::string(text).c_str());
}

}  // namespace

/// EFL keeps the space of a picture inside a label's text and draws nothing there. It draws one that somebody provides,
/// if that one is known before the text is (and if the label's style has the part for it, as the device's has).
/// And a label that wraps its lines loses its height when its theme is loaded anew, as for another reading direction:
/// EFL believes that it knows the height of this width already.
extern "C" Evas_Object* elm_label_add(Evas_Object* parent) {
    static const auto add = efl_answers::original<Evas_Object*(Evas_Object*)>("elm_label_add");
    Evas_Object* label = add ? add(parent) : nullptr;
    if (label) {
        edje_object_item_provider_set(elm_layout_edje_get(label), picture, nullptr);
        evas_object_smart_callback_add(label, "theme,changed", measure, nullptr);
    }
    return label;
}
