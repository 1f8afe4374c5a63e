#include "Calls.h"

#include <app_control.h>
#include <app_resource_manager.h>
#include <ravella-log-client.h>

#include <algorithm>
#include <array>
#include <cstdio>
#include <map>
#include <optional>
#include <sstream>
#include <stdexcept>

namespace {

constexpr int noPage = -2;

struct Event {
    int page;
    std::string line;
};

double begin = 0;
std::vector<Event> events;
std::vector<std::string> otherCalls;
std::map<std::string, int> failing;
std::map<std::string, int> throwing;
std::map<std::string, Evas_Smart_Cb> smartCallbacks;
std::map<std::string, Edje_Signal_Cb> signalCallbacks;
uxt_theme_changed_cb lastThemeCallback = nullptr;
int screenWidth = 0;
std::vector<const Evas_Object*> windowsAsked;

template <class... Arguments>
void note(const Arguments&... arguments) {
    std::ostringstream line;
    const char* separator = "";
    ((line << separator << arguments, separator = " "), ...);
    otherCalls.push_back(line.str());
}

bool fails(const std::string& name) {
    const auto found = failing.find(name);
    return found != failing.end() && --found->second == 0;
}

std::string orNull(const char* text) {
    return text ? text : "null";
}

std::string groupOf(const Evas_Object* object) {
    const char* type = elm_object_widget_check(object) ? elm_object_widget_type_get(object) : nullptr;
    if (!type || std::string(type) != "Elm_Layout")
        return "";
    const char* file = nullptr;
    const char* group = nullptr;
    elm_layout_file_get(const_cast<Evas_Object*>(object), &file, &group);
    return group ? group : "";
}

/// Where a widget stands among those in a row; nothing where it stands in none.
std::optional<int> placeInRow(const Evas_Object* object) {
    const Evas_Object* row = elm_object_parent_widget_get(object);
    const char* type = row ? elm_object_widget_type_get(row) : nullptr;
    if (!type || std::string(type) != "Elm_Box")
        return {};
    Eina_List* children = elm_box_children_get(row);
    const int place = eina_list_data_idx(children, const_cast<Evas_Object*>(object));
    eina_list_free(children);
    return place;
}

Evas_Object* pageOf(Evas_Object* object) {
    while (object && groupOf(object) != "kest/content/main")
        object = elm_object_parent_widget_get(object);
    return object;
}

/// What the tests call the object; "" for one that is of no interest.
std::string nameOf(const Evas_Object* object, const Evas_Object* page) {
    const std::string group = groupOf(object);
    if (group == "layout/multi_image")
        return "area";
    if (group == "layout/multi_image/page" || group == "layout/multi_image/hpage") {
        const std::optional<int> place = placeInRow(object);
        return place ? "picture " + std::to_string(*place) : "picture";
    }
    return page && elm_object_part_content_get(page, "info") == object ? "info" : "";
}

void tell(int page, const std::string& what) {
    std::array<char, 32> time{};
    std::snprintf(time.data(), time.size(), "%.1f ", ecore_time_get() - begin);
    events.push_back({page, time.data() + what});
}

void tellMovement(Evas_Object* scroller, const std::string& movement) {
    const Evas_Object* page = pageOf(scroller);
    tell(page ? placeInRow(page).value_or(0) : -1, (page ? "pictures " : "pages ") + movement);
}

}  // namespace

void calls::forget() {
    begin = ecore_time_get();
    events.clear();
    otherCalls.clear();
    windowsAsked.clear();
}

std::vector<std::string> calls::story(int page) {
    std::vector<std::string> lines;
    for (const Event& event : events)
        if (event.page == page || event.page == noPage)
            lines.push_back(event.line);
    return lines;
}

std::vector<std::string> calls::wholeStory() {
    std::vector<std::string> lines;
    for (const Event& event : events) {
        std::string line = event.line;
        lines.push_back(line.insert(line.find(' ') + 1, "page " + std::to_string(event.page) + ": "));
    }
    return lines;
}

std::vector<std::string> calls::steps(const std::vector<std::string>& words) {
    std::vector<std::string> found;
    for (const std::string& line : otherCalls)
        if (std::any_of(words.begin(), words.end(), [&](const std::string& word) { return line.rfind(word, 0) == 0; }))
            found.push_back(line);
    return found;
}

void calls::fail(const std::string& name, int time) {
    failing[name] = time;
}

void calls::throwIn(const std::string& name, int time) {
    throwing[name] = time;
}

void calls::throwIfDue(const std::string& name) {
    const auto found = throwing.find(name);
    if (found != throwing.end() && --found->second == 0)
        throw std::runtime_error(name + " failed");
}

void calls::setScreenWidth(int width) {
    screenWidth = width;
}

std::vector<const Evas_Object*> calls::windowsAskedForTheScreen() {
    return windowsAsked;
}

Evas_Smart_Cb calls::smartCallback(const std::string& event) {
    return smartCallbacks.at(event);
}

Edje_Signal_Cb calls::signalCallback(const std::string& signal) {
    return signalCallbacks.at(signal);
}

uxt_theme_changed_cb calls::themeCallback() {
    return lastThemeCallback;
}

#define CALL(result, name, ...)                                                                                        \
    extern "C" result __real_##name(__VA_ARGS__);                                                                      \
    extern "C" result __wrap_##name(__VA_ARGS__);                                                                      \
    result __wrap_##name(__VA_ARGS__)

CALL(void, elm_object_signal_emit, Evas_Object* object, const char* signal, const char* source) {
    Evas_Object* page = pageOf(object);
    const std::string name = nameOf(object, page);
    if (!name.empty())
        calls::throwIfDue("elm_object_signal_emit");
    if (!name.empty())
        tell(page ? placeInRow(page).value_or(0) : -1,
             name + " " + signal + (*source ? std::string(" of ") + source : ""));
    __real_elm_object_signal_emit(object, signal, source);
}

CALL(void, elm_scroller_page_bring_in, Evas_Object* scroller, int horizontal, int vertical) {
    tellMovement(scroller, "to page " + std::to_string(horizontal));
    __real_elm_scroller_page_bring_in(scroller, horizontal, vertical);
}

CALL(void, elm_scroller_page_show, Evas_Object* scroller, int horizontal, int vertical) {
    calls::throwIfDue("elm_scroller_page_show");
    tellMovement(scroller, "at page " + std::to_string(horizontal));
    __real_elm_scroller_page_show(scroller, horizontal, vertical);
}

CALL(void, elm_scroller_region_bring_in, Evas_Object* scroller, int x, int y, int width, int height) {
    tellMovement(scroller, "to y " + std::to_string(y));
    __real_elm_scroller_region_bring_in(scroller, x, y, width, height);
}

CALL(void, elm_scroller_region_show, Evas_Object* scroller, int x, int y, int width, int height) {
    tellMovement(scroller, "at y " + std::to_string(y));
    __real_elm_scroller_region_show(scroller, x, y, width, height);
}

CALL(void, elm_win_screen_size_get, const Evas_Object* window, int* x, int* y, int* width, int* height) {
    windowsAsked.push_back(window);
    __real_elm_win_screen_size_get(window, x, y, width, height);
    if (width && screenWidth > 0)
        *width = screenWidth;
}

CALL(int, ravella_log_manager_insert, ravella_log_manager_h manager, const char* uri, bundle* record,
     ravella_log_insert_cb callback, void* data, int* request) {
    tell(noPage, "record");
    return __real_ravella_log_manager_insert(manager, uri, record, callback, data, request);
}

CALL(Evas_Object*, elm_layout_add, Evas_Object* parent) {
    return fails("elm_layout_add") ? nullptr : __real_elm_layout_add(parent);
}

CALL(Evas_Object*, elm_image_add, Evas_Object* parent) {
    return fails("elm_image_add") ? nullptr : __real_elm_image_add(parent);
}

CALL(void, elm_object_item_domain_translatable_part_text_set, Elm_Object_Item* item, const char* part,
     const char* domain, const char* text) {
    calls::throwIfDue("elm_object_item_domain_translatable_part_text_set");
    note("title", orNull(part), orNull(domain), orNull(text));
    __real_elm_object_item_domain_translatable_part_text_set(item, part, domain, text);
}

CALL(Evas_Object*, elm_object_item_part_content_unset, Elm_Object_Item* item, const char* part) {
    note("unset", orNull(part));
    return __real_elm_object_item_part_content_unset(item, part);
}

CALL(void, elm_scroller_bounce_set, Evas_Object* scroller, Eina_Bool horizontal, Eina_Bool vertical) {
    if (!pageOf(scroller))
        note("bounce", horizontal ? "on" : "off", vertical ? "on" : "off");
    __real_elm_scroller_bounce_set(scroller, horizontal, vertical);
}

CALL(void, elm_scroller_policy_set, Evas_Object* scroller, Elm_Scroller_Policy horizontal,
     Elm_Scroller_Policy vertical) {
    if (!pageOf(scroller))
        note("bars", horizontal == ELM_SCROLLER_POLICY_OFF ? "off" : "on",
             vertical == ELM_SCROLLER_POLICY_OFF ? "off" : "on");
    __real_elm_scroller_policy_set(scroller, horizontal, vertical);
}

CALL(void, uxt_scroller_set_auto_scroll_enabled, Evas_Object* scroller, Eina_Bool enabled) {
    note("auto scroll", enabled ? "on" : "off");
    __real_uxt_scroller_set_auto_scroll_enabled(scroller, enabled);
}

CALL(void, evas_object_smart_callback_add, Evas_Object* object, const char* event, Evas_Smart_Cb function,
     const void* data) {
    note("callback", event);
    smartCallbacks[event] = function;
    __real_evas_object_smart_callback_add(object, event, function, data);
}

CALL(void, edje_object_signal_callback_add, Evas_Object* object, const char* signal, const char* source,
     Edje_Signal_Cb function, void* data) {
    signalCallbacks[signal] = function;
    __real_edje_object_signal_callback_add(object, signal, source, function, data);
}

CALL(void, uxt_theme_add_changed_callback, Evas_Object* object, uxt_theme_changed_cb callback, void* data) {
    note("theme +");
    lastThemeCallback = callback;
    __real_uxt_theme_add_changed_callback(object, callback, data);
}

CALL(void, uxt_theme_delete_changed_callback, Evas_Object* object, uxt_theme_changed_cb callback) {
    note("theme -");
    __real_uxt_theme_delete_changed_callback(object, callback);
}

CALL(int, app_control_create, app_control_h* request) {
    calls::throwIfDue("app_control_create");
    note("launch create");
    return __real_app_control_create(request);
}

CALL(int, app_control_set_app_id, app_control_h request, const char* id) {
    note("launch id", orNull(id));
    return __real_app_control_set_app_id(request, id);
}

CALL(int, app_control_add_extra_data, app_control_h request, const char* key, const char* value) {
    note("launch extra", orNull(key), orNull(value));
    return __real_app_control_add_extra_data(request, key, value);
}

CALL(int, app_control_send_launch_request, app_control_h request, app_control_reply_cb callback, void* data) {
    note("launch send", callback ? "with a callback" : "without a callback");
    return __real_app_control_send_launch_request(request, callback, data);
}

CALL(int, app_control_destroy, app_control_h request) {
    note("launch destroy");
    return __real_app_control_destroy(request);
}

CALL(int, app_resource_manager_get, app_resource_e type, const char* id, char** path) {
    note("resource", type, orNull(id));
    return __real_app_resource_manager_get(type, id, path);
}
