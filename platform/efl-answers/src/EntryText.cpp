#include "DrawnMarkup.h"
#include "Original.h"

#include <Elementary.h>

#include <exception>
#include <memory>
#include <string>

// What is written in markup is drawn as on a device (see DrawnMarkup.h), and reads back as it was written.

namespace {

constexpr char writtenKey[] = "efl_answers::written";

/// A text as it was given, and as EFL has it.
struct Written {
    std::string given;
    std::string drawn;
};

void setText(Evas_Object* object, const char* part, const char* text) {
    static const auto set =
        efl_answers::original<void(Evas_Object*, const char*, const char*)>("elm_object_part_text_set");
    if (set)
        set(object, part, text);
}

const char* getText(const Evas_Object* object, const char* part) {
    static const auto get =
        efl_answers::original<const char*(const Evas_Object*, const char*)>("elm_object_part_text_get");
    return get ? get(object, part) : nullptr;
}

bool isText(const Evas_Object* object, const char* part) {
    const char* type = object ? elm_object_widget_type_get(object) : nullptr;
    return type && std::string("Elm_Entry") == type &&
           (!part || std::string("elm.text") == part || std::string("default") == part);
}

void forget(void* written, Evas*, Evas_Object* entry, void*) {
    evas_object_data_del(entry, writtenKey);
    delete static_cast<Written*>(written);
}

Written* writtenIn(const Evas_Object* entry) {
    return static_cast<Written*>(evas_object_data_get(entry, writtenKey));
}

Written& makeWritten(Evas_Object* entry) {
    if (Written* written = writtenIn(entry))
        return *written;
    auto* written = new Written();
    evas_object_data_set(entry, writtenKey, written);
    evas_object_event_callback_add(entry, EVAS_CALLBACK_DEL, forget, written);
    return *written;
}

}  // namespace

/// EFL would draw a link like any other text, and Arabic lines to the left.
extern "C" void elm_object_part_text_set(Evas_Object* object, const char* part, const char* text) try {
    if (!isText(object, part) || elm_entry_editable_get(object)) {
        setText(object, part, text);
        return;
    }
    // A copy, since the text may be the one that is about to be replaced.
    const std::string given = text ? text : "";
    setText(object, part, efl_answers::drawnMarkup(given, elm_object_mirrored_get(object)).c_str());
    const char* drawn = getText(object, part);
    makeWritten(object) = {given, drawn ? drawn : ""};
} catch (const std::exception&) {
    setText(object, part, text);
}

/// The text as it was set. EFL itself asks too, and sets what it got, when the theme or the reading direction changes.
extern "C" const char* elm_object_part_text_get(const Evas_Object* object, const char* part) {
    const char* drawn = getText(object, part);
    if (!drawn || !isText(object, part))
        return drawn;
    const Written* written = writtenIn(object);
    return written && written->drawn == drawn ? written->given.c_str() : drawn;
}
