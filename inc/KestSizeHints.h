#pragma once

#include <Elementary.h>

/// How an object takes the room that its container has for it. Static; holds no state.
class KestSizeHints {
public:
    /// It wants all of the room.
    static void expand(Evas_Object* object) {
        evas_object_size_hint_weight_set(object, EVAS_HINT_EXPAND, EVAS_HINT_EXPAND);
    }
    /// It wants all of the room and covers it.
    static void fill(Evas_Object* object) {
        evas_object_size_hint_align_set(object, EVAS_HINT_FILL, EVAS_HINT_FILL);
        expand(object);
    }
};
