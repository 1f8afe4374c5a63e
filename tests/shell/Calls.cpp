#include "NotedCalls.h"

#include <Elementary.h>
#include <app-assist/WApp.h>
#include <app-assist/WAppEventHandler.h>
#include <app-assist/WUiTimer.h>
#include <app_extension.h>
#include <app_resource_manager.h>
#include <ravella-log-client.h>
#include <ui_extension.h>

#include <algorithm>
#include <utility>

namespace {

std::vector<std::string> all;
std::set<std::string> failing;
bool rotationSupported = false;
std::function<void()> lookWhenTheLanguageIsSet;
std::function<void()> lookWhenARecordIsWritten;

bool fails(const std::string& name) {
    return failing.count(name) > 0;
}

}  // namespace

using calls::note;
using calls::orNull;

const std::vector<std::string>& calls::made() {
    return all;
}

std::vector<std::string> calls::madeOf(const std::vector<std::string>& names) {
    std::vector<std::string> found;
    for (const std::string& line : all)
        if (std::any_of(names.begin(), names.end(), [&](const std::string& name) { return line.rfind(name, 0) == 0; }))
            found.push_back(line);
    return found;
}

void calls::add(std::string line) {
    all.push_back(std::move(line));
}

void calls::forget() {
    all.clear();
}

void calls::fail(const std::string& name) {
    failing.insert(name);
}

void calls::whenARecordIsWritten(std::function<void()> look) {
    lookWhenARecordIsWritten = std::move(look);
}

void calls::whenTheLanguageIsSet(std::function<void()> look) {
    lookWhenTheLanguageIsSet = std::move(look);
}

void calls::setRotationSupported(bool supported) {
    rotationSupported = supported;
}

// WAppEventHandler::addEventHandler(), which the linker knows by this name. The object that it is called on goes first.
#define ADD_EVENT_HANDLER                                                                                              \
    "_ZN10app_assist16WAppEventHandler15addEventHandlerE16app_event_type_eSt8functionIFvP14app_event_infoPvEES5_"

using EventHandler = app_assist::WAppEventHandler;
void addEventHandler(EventHandler* self, app_event_type_e type, EventHandler::Handler handler,
                     void* data) __asm__("__real_" ADD_EVENT_HANDLER);
void addAndNoteEventHandler(EventHandler* self, app_event_type_e type, EventHandler::Handler handler,
                            void* data) __asm__("__wrap_" ADD_EVENT_HANDLER);

void addAndNoteEventHandler(EventHandler* self, app_event_type_e type, EventHandler::Handler handler, void* data) {
    const bool isApplication = data && data == app_assist::WApp::getInstance();
    note("addEventHandler", type, isApplication ? "application" : orNull(data, "data"));
    addEventHandler(self, type, std::move(handler), data);
}

// WUiTimer::addIdler(), likewise.
#define ADD_IDLER "_ZN10app_assist8WUiTimer8addIdlerESt8functionIFbPNS_5WViewEEES3_P10_Eo_Opaque"

using app_assist::WUiTimer;
WUiTimer::Handle addIdler(WUiTimer::Function function, app_assist::WView* view,
                          Evas_Object* owner) __asm__("__real_" ADD_IDLER);
WUiTimer::Handle addAndNoteIdler(WUiTimer::Function function, app_assist::WView* view,
                                 Evas_Object* owner) __asm__("__wrap_" ADD_IDLER);

WUiTimer::Handle addAndNoteIdler(WUiTimer::Function function, app_assist::WView* view, Evas_Object* owner) {
    const std::string ownersType = orNull(owner ? elm_object_widget_type_get(owner) : nullptr);
    note("addIdler", ownersType);
    const auto noted = [function = std::move(function), ownersType](app_assist::WView* each) {
        const bool again = function(each);
        note("idlerRan", ownersType, again ? "again" : "once");
        return again;
    };
    return addIdler(noted, view, owner);
}

CALL(Evas_Object*, elm_naviframe_add, Evas_Object* parent) {
    note("elm_naviframe_add");
    return __real_elm_naviframe_add(parent);
}

CALL(void*, app_get_preinitialized_window, const char* name) {
    note("app_get_preinitialized_window", name);
    return fails("app_get_preinitialized_window") ? nullptr : __real_app_get_preinitialized_window(name);
}

CALL(int, app_resource_manager_get, app_resource_e type, const char* id, char** path) {
    note("app_resource_manager_get", type, id);
    if (!fails("app_resource_manager_get"))
        return __real_app_resource_manager_get(type, id, path);
    *path = nullptr;
    return APP_RESOURCE_ERROR_IO_ERROR;
}

CALL(bundle*, bundle_create, void) {
    note("bundle_create");
    return fails("bundle_create") ? nullptr : __real_bundle_create();
}

CALL(int, bundle_add_str, bundle* b, const char* key, const char* value) {
    note("bundle_add_str", key, value);
    return __real_bundle_add_str(b, key, value);
}

CALL(int, bundle_free, bundle* b) {
    note("bundle_free");
    return __real_bundle_free(b);
}

CALL(int, ravella_log_manager_create, ravella_log_manager_h* handle) {
    note("ravella_log_manager_create");
    return __real_ravella_log_manager_create(handle);
}

CALL(int, ravella_log_manager_insert, ravella_log_manager_h handle, const char* uri, bundle* record,
     ravella_log_insert_cb callback, void* data, int* request) {
    note("ravella_log_manager_insert", uri, callback ? "callback" : "null", orNull(data, "data"),
         orNull(request, "number"));
    if (lookWhenARecordIsWritten)
        lookWhenARecordIsWritten();
    return __real_ravella_log_manager_insert(handle, uri, record, callback, data, request);
}

CALL(int, ravella_log_manager_destroy, ravella_log_manager_h handle) {
    note("ravella_log_manager_destroy");
    const int result = __real_ravella_log_manager_destroy(handle);
    return fails("ravella_log_manager_destroy") ? -5 : result;
}

CALL(void, elm_app_base_scale_set, double scale) {
    note("elm_app_base_scale_set", scale);
    __real_elm_app_base_scale_set(scale);
}

CALL(Evas_Object*, elm_button_add, Evas_Object* parent) {
    note("elm_button_add");
    return fails("elm_button_add") ? nullptr : __real_elm_button_add(parent);
}

CALL(Evas_Object*, uxt_button_add, Evas_Object* parent, const char* style) {
    note("uxt_button_add", orNull(style));
    return fails("uxt_button_add") ? nullptr : __real_uxt_button_add(parent, style);
}

CALL(void, elm_language_set, const char* language) {
    note("elm_language_set", orNull(language));
    if (lookWhenTheLanguageIsSet)
        lookWhenTheLanguageIsSet();
    __real_elm_language_set(language);
}

CALL(void, elm_naviframe_prev_btn_auto_pushed_set, Evas_Object* object, Eina_Bool set) {
    note("elm_naviframe_prev_btn_auto_pushed_set", orNull(object, "naviframe"), set ? "true" : "false");
    __real_elm_naviframe_prev_btn_auto_pushed_set(object, set);
}

CALL(Evas_Object*, elm_win_add, Evas_Object* parent, const char* name, Elm_Win_Type type) {
    note("elm_win_add", orNull(parent, "parent"), name, type);
    return fails("elm_win_add") ? nullptr : __real_elm_win_add(parent, name, type);
}

CALL(void, elm_win_autodel_set, Evas_Object* win, Eina_Bool set) {
    note("elm_win_autodel_set", set ? "true" : "false");
    __real_elm_win_autodel_set(win, set);
}

CALL(void, elm_win_indicator_mode_set, Evas_Object* win, Elm_Win_Indicator_Mode mode) {
    note("elm_win_indicator_mode_set", mode);
    __real_elm_win_indicator_mode_set(win, mode);
}

CALL(void, elm_win_indicator_opacity_set, Evas_Object* win, Elm_Win_Indicator_Opacity_Mode mode) {
    note("elm_win_indicator_opacity_set", mode);
    __real_elm_win_indicator_opacity_set(win, mode);
}

CALL(void, elm_win_title_set, Evas_Object* win, const char* title) {
    note("elm_win_title_set", title, evas_object_visible_get(win) ? "shown" : "hidden");
    __real_elm_win_title_set(win, title);
}

CALL(Eina_Bool, elm_win_wm_rotation_supported_get, const Evas_Object*) {
    note("elm_win_wm_rotation_supported_get");
    return rotationSupported ? EINA_TRUE : EINA_FALSE;
}

CALL(void, elm_win_wm_rotation_available_rotations_set, Evas_Object* win, const int* rotations, unsigned int count) {
    note("elm_win_wm_rotation_available_rotations_set", rotations[0], rotations[1], rotations[2], rotations[3], "of",
         count);
    __real_elm_win_wm_rotation_available_rotations_set(win, rotations, count);
}

CALL(void, elm_win_wm_rotation_preferred_rotation_set, Evas_Object* win, int rotation) {
    note("elm_win_wm_rotation_preferred_rotation_set", rotation);
    __real_elm_win_wm_rotation_preferred_rotation_set(win, rotation);
}

CALL(uxt_color_table_h, uxt_theme_add_color_table, const char* path) {
    note("uxt_theme_add_color_table", path);
    return fails("uxt_theme_add_color_table") ? nullptr : __real_uxt_theme_add_color_table(path);
}

CALL(uxt_font_table_h, uxt_theme_add_font_table, const char* path) {
    note("uxt_theme_add_font_table", path);
    return fails("uxt_theme_add_font_table") ? nullptr : __real_uxt_theme_add_font_table(path);
}

CALL(void, uxt_theme_delete_color_table, uxt_color_table_h table) {
    note("uxt_theme_delete_color_table", orNull(table, "table"));
    __real_uxt_theme_delete_color_table(table);
}

CALL(void, uxt_theme_delete_font_table, uxt_font_table_h table) {
    note("uxt_theme_delete_font_table", orNull(table, "table"));
    __real_uxt_theme_delete_font_table(table);
}

CALL(void, uxt_theme_set_changeable_ui_enabled, Eina_Bool enabled) {
    note("uxt_theme_set_changeable_ui_enabled", enabled ? "true" : "false");
    __real_uxt_theme_set_changeable_ui_enabled(enabled);
}

CALL(void, uxt_theme_set_style, int style) {
    note("uxt_theme_set_style", style);
    __real_uxt_theme_set_style(style);
}

CALL(void, uxt_theme_set_color_table, uxt_color_table_h table) {
    note("uxt_theme_set_color_table", orNull(table, "table"));
    __real_uxt_theme_set_color_table(table);
}

CALL(void, uxt_theme_set_font_table, uxt_font_table_h table) {
    note("uxt_theme_set_font_table", orNull(table, "table"));
    __real_uxt_theme_set_font_table(table);
}

CALL(void, uxt_theme_object_set_changeable_ui_enabled, Evas_Object* object, Eina_Bool enabled) {
    note("uxt_theme_object_set_changeable_ui_enabled", orNull(object, "object"), enabled ? "true" : "false");
    __real_uxt_theme_object_set_changeable_ui_enabled(object, enabled);
}

CALL(void, uxt_theme_object_set_style, Evas_Object* object, int style) {
    note("uxt_theme_object_set_style", orNull(object, "object"), style);
    __real_uxt_theme_object_set_style(object, style);
}

CALL(void, uxt_theme_object_set_color_table, Evas_Object* object, uxt_color_table_h table) {
    note("uxt_theme_object_set_color_table", orNull(object, "object"), orNull(table, "table"));
    __real_uxt_theme_object_set_color_table(object, table);
}

CALL(void, uxt_theme_object_set_font_table, Evas_Object* object, uxt_font_table_h table) {
    note("uxt_theme_object_set_font_table", orNull(object, "object"), orNull(table, "table"));
    __real_uxt_theme_object_set_font_table(object, table);
}
