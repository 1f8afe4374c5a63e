#include "Original.h"
#include "TextPicture.h"

#include <Elementary.h>

namespace {

Evas_Object* picture(void*, Evas_Object* entry, const char* href) {
    return efl_answers::textPicture(evas_object_evas_get(entry), href);
}

}  // namespace

/// EFL opens a menu after a long press, also over text that nobody can write in, and the next tap only closes it: a
/// link would not work. A device has no such menu, and no mouse whose pointer would become a bar over text. Pictures
/// inside the text are found and shown as in a label; EFL itself looks for them below the current folder, draws a face
/// for one that it cannot read, and waits for ever on a pipe.
extern "C" Evas_Object* elm_entry_add(Evas_Object* parent) {
    static const auto add = efl_answers::original<Evas_Object*(Evas_Object*)>("elm_entry_add");
    Evas_Object* entry = add ? add(parent) : nullptr;
    if (entry) {
        elm_entry_context_menu_disabled_set(entry, EINA_TRUE);
        elm_object_cursor_unset(elm_layout_edje_get(entry));
        elm_entry_item_provider_append(entry, picture, nullptr);
    }
    return entry;
}
