#include "Calls.h"

#include <ravella-log-client.h>

#include <new>

calls::Made& calls::made() {
    static Made made;
    return made;
}

using calls::made;

static void throwIfPlanned() {
    if (made().outOfMemory)
        throw std::bad_alloc();
}

extern "C" {

Evas_Object* __real_elm_naviframe_item_pop(Evas_Object* naviframe);
Evas_Object* __wrap_elm_naviframe_item_pop(Evas_Object* naviframe);
Evas_Object* __real_elm_genlist_add(Evas_Object* parent);
Evas_Object* __wrap_elm_genlist_add(Evas_Object* parent);
Elm_Object_Item* __real_elm_genlist_item_append(Evas_Object* list, const Elm_Genlist_Item_Class* itc, const void* data,
                                                Elm_Object_Item* parent, Elm_Genlist_Item_Type type, Evas_Smart_Cb func,
                                                const void* funcData);
Elm_Object_Item* __wrap_elm_genlist_item_append(Evas_Object* list, const Elm_Genlist_Item_Class* itc, const void* data,
                                                Elm_Object_Item* parent, Elm_Genlist_Item_Type type, Evas_Smart_Cb func,
                                                const void* funcData);
void __real_elm_genlist_clear(Evas_Object* list);
void __wrap_elm_genlist_clear(Evas_Object* list);
void __real_elm_genlist_realized_items_update(Evas_Object* list);
void __wrap_elm_genlist_realized_items_update(Evas_Object* list);
void __real_elm_genlist_item_selected_set(Elm_Object_Item* row, Eina_Bool selected);
void __wrap_elm_genlist_item_selected_set(Elm_Object_Item* row, Eina_Bool selected);
void __real_elm_object_item_domain_translatable_part_text_set(Elm_Object_Item* item, const char* part,
                                                              const char* domain, const char* text);
void __wrap_elm_object_item_domain_translatable_part_text_set(Elm_Object_Item* item, const char* part,
                                                              const char* domain, const char* text);
void __real_elm_theme_extension_add(Elm_Theme* theme, const char* file);
void __wrap_elm_theme_extension_add(Elm_Theme* theme, const char* file);
void __real_evas_object_smart_callback_add(Evas_Object* object, const char* event, Evas_Smart_Cb func,
                                           const void* data);
void __wrap_evas_object_smart_callback_add(Evas_Object* object, const char* event, Evas_Smart_Cb func,
                                           const void* data);
void __real_uxt_theme_add_changed_callback(Evas_Object* object, uxt_theme_changed_cb callback, void* data);
void __wrap_uxt_theme_add_changed_callback(Evas_Object* object, uxt_theme_changed_cb callback, void* data);
void __real_uxt_theme_delete_changed_callback(Evas_Object* object, uxt_theme_changed_cb callback);
void __wrap_uxt_theme_delete_changed_callback(Evas_Object* object, uxt_theme_changed_cb callback);
int __real_package_manager_create(package_manager_h* manager);
int __wrap_package_manager_create(package_manager_h* manager);
int __real_package_manager_set_event_cb(package_manager_h manager, package_manager_event_cb callback, void* data);
int __wrap_package_manager_set_event_cb(package_manager_h manager, package_manager_event_cb callback, void* data);
int __real_package_manager_unset_event_cb(package_manager_h manager);
int __wrap_package_manager_unset_event_cb(package_manager_h manager);
int __real_package_manager_destroy(package_manager_h manager);
int __wrap_package_manager_destroy(package_manager_h manager);
int __real_ravella_log_manager_insert(ravella_log_manager_h handle, const char* uri, bundle* record,
                                      ravella_log_insert_cb callback, void* data, int* request);
int __wrap_ravella_log_manager_insert(ravella_log_manager_h handle, const char* uri, bundle* record,
                                      ravella_log_insert_cb callback, void* data, int* request);

Evas_Object* __wrap_elm_naviframe_item_pop(Evas_Object* naviframe) {
    if (made().whenPopped)
        made().whenPopped();
    return __real_elm_naviframe_item_pop(naviframe);
}

Evas_Object* __wrap_elm_genlist_add(Evas_Object* parent) {
    return made().failGenlist ? nullptr : __real_elm_genlist_add(parent);
}

Elm_Object_Item* __wrap_elm_genlist_item_append(Evas_Object* list, const Elm_Genlist_Item_Class* itc, const void* data,
                                                Elm_Object_Item* parent, Elm_Genlist_Item_Type type, Evas_Smart_Cb func,
                                                const void* funcData) {
    made().steps.emplace_back("row");
    made().rows.push_back({itc, data, parent, func, funcData, type});
    return __real_elm_genlist_item_append(list, itc, data, parent, type, func, funcData);
}

void __wrap_elm_genlist_clear(Evas_Object* list) {
    throwIfPlanned();
    ++made().clears;
    made().rows.clear();
    __real_elm_genlist_clear(list);
}

void __wrap_elm_genlist_realized_items_update(Evas_Object* list) {
    throwIfPlanned();
    ++made().updates;
    __real_elm_genlist_realized_items_update(list);
}

void __wrap_elm_genlist_item_selected_set(Elm_Object_Item* row, Eina_Bool selected) {
    throwIfPlanned();
    __real_elm_genlist_item_selected_set(row, selected);
}

void __wrap_elm_object_item_domain_translatable_part_text_set(Elm_Object_Item* item, const char* part,
                                                              const char* domain, const char* text) {
    made().steps.emplace_back("title");
    made().translatableTexts.push_back(std::string(part) + ": " + text + " of " + domain);
    __real_elm_object_item_domain_translatable_part_text_set(item, part, domain, text);
}

void __wrap_elm_theme_extension_add(Elm_Theme* theme, const char* file) {
    made().themeExtensions.emplace_back(file);
    __real_elm_theme_extension_add(theme, file);
}

void __wrap_evas_object_smart_callback_add(Evas_Object* object, const char* event, Evas_Smart_Cb func,
                                           const void* data) {
    made().smartCallbacks[event] = func;
    __real_evas_object_smart_callback_add(object, event, func, data);
}

void __wrap_uxt_theme_add_changed_callback(Evas_Object* object, uxt_theme_changed_cb callback, void* data) {
    made().registrations.emplace_back(object ? "theme + of an object" : "theme +");
    made().themeCallback = callback;
    __real_uxt_theme_add_changed_callback(object, callback, data);
}

void __wrap_uxt_theme_delete_changed_callback(Evas_Object* object, uxt_theme_changed_cb callback) {
    const bool same = !object && callback == made().themeCallback;
    made().registrations.emplace_back(same ? "theme -" : "theme - of another");
    __real_uxt_theme_delete_changed_callback(object, callback);
}

int __wrap_package_manager_create(package_manager_h* manager) {
    made().steps.emplace_back("package manager");
    made().registrations.emplace_back("package create");
    return __real_package_manager_create(manager);
}

int __wrap_package_manager_set_event_cb(package_manager_h manager, package_manager_event_cb callback, void* data) {
    made().registrations.emplace_back("package set");
    made().packageCallback = callback;
    return __real_package_manager_set_event_cb(manager, callback, data);
}

int __wrap_package_manager_unset_event_cb(package_manager_h manager) {
    made().registrations.emplace_back("package unset");
    return __real_package_manager_unset_event_cb(manager);
}

int __wrap_package_manager_destroy(package_manager_h manager) {
    made().registrations.emplace_back("package destroy");
    return __real_package_manager_destroy(manager);
}

int __wrap_ravella_log_manager_insert(ravella_log_manager_h handle, const char* uri, bundle* record,
                                      ravella_log_insert_cb callback, void* data, int* request) {
    if (made().whenRecorded)
        made().whenRecorded();
    return __real_ravella_log_manager_insert(handle, uri, record, callback, data, request);
}
}
