// Telling a group of objects from a single one takes a call that EFL still marks as beta.
#define EFL_BETA_API_SUPPORT

#include "ui/Widgets.h"

#include <Eo.h>

#include <cstdlib>

namespace test_ui {

namespace {

void collect(Evas_Object* object, const std::string& type, std::vector<Evas_Object*>& found) {
    if (!evas_object_visible_get(object))
        return;
    const char* own = elm_object_widget_check(object) ? elm_object_widget_type_get(object) : nullptr;
    if (own && type == own)
        found.push_back(object);
    if (!efl_isa(object, EFL_CANVAS_GROUP_CLASS))
        return;
    Eina_List* members = evas_object_smart_members_get(object);
    void* member = nullptr;
    EINA_LIST_FREE(members, member)
    collect(static_cast<Evas_Object*>(member), type, found);
}

std::string orEmpty(const char* text) {
    return text ? text : "";
}

}  // namespace

std::vector<Evas_Object*> widgets(Evas_Object* root, const std::string& type) {
    std::vector<Evas_Object*> found;
    if (!root)
        return found;
    // What stands in a window is no member of it, but lies on its canvas.
    if (!evas_object_smart_parent_get(root) && elm_object_top_widget_get(root) == root)
        for (auto* each = evas_object_bottom_get(evas_object_evas_get(root)); each; each = evas_object_above_get(each))
            collect(each, type, found);
    else
        collect(root, type, found);
    return found;
}

Evas_Object* widget(Evas_Object* root, const std::string& type) {
    const auto found = widgets(root, type);
    return found.empty() ? nullptr : found.front();
}

std::string text(const Evas_Object* widget, const char* part) {
    return orEmpty(elm_object_part_text_get(widget, part));
}

std::string itemText(const Elm_Object_Item* item, const char* part) {
    return orEmpty(elm_object_item_part_text_get(item, part));
}

std::string plainText(const Evas_Object* widget, const char* part) {
    char* plain = elm_entry_markup_to_utf8(text(widget, part).c_str());
    std::string result = orEmpty(plain);
    std::free(plain);
    return result;
}

std::vector<Elm_Object_Item*> rows(const Evas_Object* genlist) {
    std::vector<Elm_Object_Item*> items;
    for (auto* item = elm_genlist_first_item_get(genlist); item; item = elm_genlist_item_next_get(item))
        items.push_back(item);
    return items;
}

Rect rowGeometry(Elm_Object_Item* row) {
    Evas_Object* track = elm_object_item_track(row);
    if (!track)
        return {};
    const Rect rect = geometry(track);
    elm_object_item_untrack(row);
    return rect;
}

Rect link(const Evas_Object* entry, const std::string& href) {
    const Evas_Object* layout = elm_layout_edje_get(entry);
    const Eina_List* rectangles = edje_object_part_text_anchor_geometry_get(layout, "elm.text", href.c_str());
    if (!rectangles)
        return {};
    const auto* rectangle = static_cast<const Evas_Textblock_Rectangle*>(eina_list_data_get(rectangles));
    const Rect origin = geometry(edje_object_part_object_get(layout, "elm.text"));
    return {origin.x + rectangle->x, origin.y + rectangle->y, rectangle->w, rectangle->h};
}

}  // namespace test_ui
