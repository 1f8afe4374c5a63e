#include "ui_extension.h"

#include "Appearance.h"
#include "AutoScroll.h"
#include "ChangedCallbacks.h"
#include "Log.h"
#include "TableFile.h"

#include <stdexcept>

using uxt::Appearance;
using uxt::guarded;
using uxt::TableChoice;

namespace {

template <typename Table>
void deleteTable(const char* function, Table* table) {
    guarded(function, [table] {
        if (table && !Appearance::ofProcess().remove(table))
            throw std::invalid_argument("there is no such table");
    });
}

void chooseForObject(const char* function, Evas_Object* object, const std::function<void(TableChoice&)>& change) {
    guarded(function, [&] {
        if (!object)
            throw std::invalid_argument("no object");
        Appearance::ofProcess().choose(object, change);
    });
}

void chooseForApplication(const char* function, const std::function<void(TableChoice&)>& change) {
    guarded(function, [&] { Appearance::ofProcess().choose(nullptr, change); });
}

template <typename Table>
Table* addTable(const char* function, Table (*read)(const std::string&), const char* path) {
    return guarded(function, static_cast<Table*>(nullptr), [read, path]() -> Table* {
        if (!path || !*path)
            throw std::invalid_argument("no file is named");
        try {
            return Appearance::ofProcess().add(read(path));
        } catch (const uxt::TableError& error) {
            // As a compiler says it, so that an editor finds the place.
            dlog_print(DLOG_ERROR, uxt::logTag, "%s", error.what());
            return nullptr;
        }
    });
}

}  // namespace

uxt_color_table_h uxt_theme_add_color_table(const char* path) {
    return addTable<uxt_color_table>(__func__, uxt::readColorTable, path);
}

uxt_font_table_h uxt_theme_add_font_table(const char* path) {
    return addTable<uxt_font_table>(__func__, uxt::readFontTable, path);
}

void uxt_theme_delete_color_table(uxt_color_table_h table) {
    deleteTable(__func__, table);
}

void uxt_theme_delete_font_table(uxt_font_table_h table) {
    deleteTable(__func__, table);
}

void uxt_theme_set_changeable_ui_enabled(Eina_Bool enabled) {
    chooseForApplication(__func__, [enabled](TableChoice& choice) { choice.enabled = enabled; });
}

void uxt_theme_set_style(int style) {
    chooseForApplication(__func__, [style](TableChoice& choice) { choice.style = style; });
}

void uxt_theme_set_color_table(uxt_color_table_h table) {
    chooseForApplication(__func__, [table](TableChoice& choice) { choice.colours = table; });
}

void uxt_theme_set_font_table(uxt_font_table_h table) {
    chooseForApplication(__func__, [table](TableChoice& choice) { choice.fonts = table; });
}

void uxt_theme_object_set_changeable_ui_enabled(Evas_Object* obj, Eina_Bool enabled) {
    chooseForObject(__func__, obj, [enabled](TableChoice& choice) { choice.enabled = enabled; });
}

void uxt_theme_object_set_style(Evas_Object* obj, int style) {
    chooseForObject(__func__, obj, [style](TableChoice& choice) { choice.style = style; });
}

void uxt_theme_object_set_color_table(Evas_Object* obj, uxt_color_table_h table) {
    chooseForObject(__func__, obj, [table](TableChoice& choice) { choice.colours = table; });
}

void uxt_theme_object_set_font_table(Evas_Object* obj, uxt_font_table_h table) {
    chooseForObject(__func__, obj, [table](TableChoice& choice) { choice.fonts = table; });
}

void uxt_theme_add_changed_callback(Evas_Object* obj, uxt_theme_changed_cb callback, void* user_data) {
    guarded(__func__, [&] {
        if (!callback)
            throw std::invalid_argument("no callback");
        uxt::ChangedCallbacks::ofProcess().add(obj, callback, user_data);
    });
}

void uxt_theme_delete_changed_callback(Evas_Object* obj, uxt_theme_changed_cb callback) {
    guarded(__func__, [&] {
        if (!uxt::ChangedCallbacks::ofProcess().remove(obj, callback))
            throw std::invalid_argument("the callback is not registered");
    });
}

Evas_Object* uxt_button_add(Evas_Object* parent, const char* style) {
    Evas_Object* button = parent ? elm_button_add(parent) : nullptr;
    if (button && style && !elm_object_style_set(button, style))
        dlog_print(DLOG_WARN, uxt::logTag, "%s: the theme has no button style \"%s\"", __func__, style);
    return button;
}

void uxt_scroller_set_auto_scroll_enabled(Evas_Object* scroller, Eina_Bool enabled) {
    guarded(__func__, [&] { uxt::setAutoScroll(scroller, enabled); });
}
