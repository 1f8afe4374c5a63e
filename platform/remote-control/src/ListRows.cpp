#include "ListRows.h"

#include "ThemeParts.h"

#include <Elementary.h>

#include <cstdlib>
#include <memory>

namespace remote_control {

namespace {

struct Free {
    void operator()(char* text) const { std::free(text); }
};

/// The item's place, as long as the list draws it.
bool placeOfDrawn(Elm_Object_Item* item, Rectangle& place) {
    const Evas_Object* track = elm_object_item_track(item);
    if (!track) {
        return false;
    }
    evas_object_geometry_get(track, &place.x, &place.y, &place.width, &place.height);
    elm_object_item_untrack(item);
    return true;
}

std::string groupOf(const Evas_Object* list, const std::string& style) {
    const char* kind = elm_genlist_mode_get(list) == ELM_LIST_COMPRESS ? "item_compress" : "item";
    const char* listStyle = elm_object_style_get(list);
    const std::string begin = std::string("elm/genlist/") + kind + "/" + style + "/";
    return begin + (listStyle ? listStyle : "default");
}

/// An item out of sight has no object; the list would ask its class, and so do we.
Element undrawn(Elm_Object_Item* item, Evas_Object* list, const Elm_Genlist_Item_Class& itemClass, ThemeParts& parts) {
    Element element;
    element.type = "Edje";
    element.group = groupOf(list, itemClass.item_style ? itemClass.item_style : "default");
    if (!itemClass.func.text_get) {
        return element;
    }
    for (const std::string& part : parts.itemTexts(element.group)) {
        const std::unique_ptr<char, Free> text(
            itemClass.func.text_get(elm_object_item_data_get(item), list, part.c_str()));
        if (text && *text) {
            element.texts.push_back({part, plainText(text.get()), {}, {}, nullptr});
        }
    }
    return element;
}

}  // namespace

bool isRow(const Element& element) {
    return element.type == "Edje" && element.group.starts_with("elm/genlist/") &&
           !element.group.starts_with("elm/genlist/base/");
}

void readRows(Element& element, Evas_Object* list, ThemeParts& parts) {
    std::vector<Element> drawn;
    std::vector<Element> others;
    for (Element& child : element.children) {
        (isRow(child) ? drawn : others).push_back(std::move(child));
    }
    element.children = std::move(others);
    for (Elm_Object_Item* item = elm_genlist_first_item_get(list); item; item = elm_genlist_item_next_get(item)) {
        const Elm_Genlist_Item_Class* itemClass = elm_genlist_item_item_class_get(item);
        Row row;
        row.index = elm_genlist_item_index_get(item);
        row.style = itemClass && itemClass->item_style ? itemClass->item_style : "default";
        Rectangle place;
        auto view = drawn.end();
        if (placeOfDrawn(item, place)) {
            view = std::find_if(drawn.begin(), drawn.end(), [&](const Element& e) { return e.place == place; });
        }
        if (view != drawn.end()) {
            row.element = std::move(*view);
            drawn.erase(view);
        } else if (itemClass) {
            row.element = undrawn(item, list, *itemClass, parts);
        }
        element.rows.push_back(std::move(row));
    }
}

}  // namespace remote_control
