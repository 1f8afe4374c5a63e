#include "Element.h"
#include "ListRows.h"
#include "Objects.h"
#include "ThemeParts.h"

#include <Edje.h>
#include <Elementary.h>

#include <memory>

namespace remote_control {

namespace {

std::string orEmpty(const char* text) {
    return text ? text : "";
}

Rectangle placeOf(const Evas_Object* object) {
    Rectangle place;
    evas_object_geometry_get(object, &place.x, &place.y, &place.width, &place.height);
    return place;
}

bool opaqueEnough(const Evas_Object* object) {
    int alpha = 0;
    evas_object_color_get(object, nullptr, nullptr, nullptr, &alpha);
    return alpha > 0;
}

bool stopsAtPages(int size, double relative) {
    return size > 0 || relative > 0;
}

/// In the direction in which it stops at pages; where it does in both, from left to right.
Pages pagesOf(const Evas_Object* scroller) {
    int width = 0, height = 0, column = 0, row = 0, lastColumn = 0, lastRow = 0;
    double relativeWidth = 0, relativeHeight = 0;
    elm_scroller_page_size_get(scroller, &width, &height);
    elm_scroller_page_relative_get(scroller, &relativeWidth, &relativeHeight);
    elm_scroller_current_page_get(scroller, &column, &row);
    elm_scroller_last_page_get(scroller, &lastColumn, &lastRow);
    if (stopsAtPages(width, relativeWidth)) {
        return {column + 1, lastColumn + 1};
    }
    return stopsAtPages(height, relativeHeight) ? Pages{row + 1, lastRow + 1} : Pages{};
}

bool holdsSomething(const Element& element) {
    return !element.name.empty() || !element.file.empty() || !element.texts.empty() || !element.children.empty() ||
           !element.rows.empty() || !element.items.empty();
}

/// Not so for the empty helpers that windows keep at hand, nor for the window itself, whose contents lie beside it.
bool tellsSomething(const Element& element) {
    return holdsSomething(element) || (!element.place.empty() && element.type != "Elm_Win");
}

struct ListFree {
    void operator()(Eina_List* list) const { eina_list_free(list); }
};

/// Walks the objects of a canvas and gathers what they show. What neither is nor holds anything to name is left out.
class ScreenReader {
public:
    explicit ScreenReader(Evas_Object* window) : canvas_(evas_object_evas_get(window)), parts_(canvas_) {
        evas_output_size_get(canvas_, &screen_.width, &screen_.height);
    }

    std::vector<Element> read() {
        evas_smart_objects_calculate(canvas_);
        Element all;
        for (Evas_Object* object : topObjects(canvas_)) {
            readInto(all, object, true);
        }
        return std::move(all.children);
    }

private:
    void readInto(Element& parent, Evas_Object* object, bool parentShown);
    Element readWidget(Evas_Object* object, bool shown);
    void readThemed(Element& parent, Evas_Object* object, bool shown);
    void readParts(Element& element, Evas_Object* themed, bool shown);
    void readText(Element& parent, Evas_Object* object, const std::string& text, bool shown);
    static void readStack(Element& element, Evas_Object* naviframe);
    Rectangle seenOf(Evas_Object* object, bool shown) const;

    Evas* canvas_;
    Rectangle screen_;
    ThemeParts parts_;
};

Rectangle ScreenReader::seenOf(Evas_Object* object, bool shown) const {
    if (!shown || !opaqueEnough(object)) {
        return {};
    }
    Rectangle seen = placeOf(object).cutTo(screen_);
    for (Evas_Object* clip = evas_object_clip_get(object); clip; clip = evas_object_clip_get(clip)) {
        if (!evas_object_visible_get(clip) || !opaqueEnough(clip)) {
            return {};
        }
        seen = seen.cutTo(placeOf(clip));
    }
    return seen;
}

void ScreenReader::readInto(Element& parent, Evas_Object* object, bool parentShown) {
    const std::string type = orEmpty(evas_object_type_get(object));
    const bool shown = parentShown && evas_object_visible_get(object);
    if (isWidget(object)) {
        Element widget = readWidget(object, shown);
        if (tellsSomething(widget)) {
            parent.children.push_back(std::move(widget));
        }
    } else if (type == "edje") {
        readThemed(parent, object, shown);
    } else if (type == "text" && evas_object_visible_get(object)) {
        readText(parent, object, orEmpty(evas_object_text_text_get(object)), shown);
    } else if (type == "textblock" && evas_object_visible_get(object)) {
        readText(parent, object, plainText(orEmpty(evas_object_textblock_text_markup_get(object))), shown);
    } else {
        for (Evas_Object* member : membersOf(object)) {
            readInto(parent, member, shown);
        }
    }
}

Element ScreenReader::readWidget(Evas_Object* object, bool shown) {
    Element element;
    element.type = orEmpty(elm_object_widget_type_get(object));
    element.name = orEmpty(evas_object_name_get(object));
    element.style = orEmpty(elm_object_style_get(object));
    element.object = object;
    element.place = placeOf(object);
    element.seen = seenOf(object, shown);
    if (element.type == "Elm_Image" || element.type == "Elm_Icon") {
        const char* file = nullptr;
        elm_image_file_get(object, &file, nullptr);
        element.file = orEmpty(file);
    }
    for (Evas_Object* member : membersOf(object)) {
        readInto(element, member, shown);
    }
    if (element.type == "Elm_Naviframe") {
        readStack(element, object);
    } else if (element.type == "Elm_Genlist") {
        readRows(element, object, parts_);
    } else if (element.type == "Elm_Scroller") {
        element.pages = pagesOf(object);
    }
    return element;
}

/// The themed object of a widget becomes part of the widget; one on its own is an element of its own.
void ScreenReader::readThemed(Element& parent, Evas_Object* object, bool shown) {
    const char* file = nullptr;
    const char* group = nullptr;
    edje_object_file_get(object, &file, &group);
    const bool widgetsOwn = isWidget(evas_object_smart_parent_get(object)) && parent.group.empty();
    Element own;
    own.type = "Edje";
    own.name = orEmpty(evas_object_name_get(object));
    Element& element = widgetsOwn ? parent : own;
    element.group = orEmpty(group);
    if (!widgetsOwn) {
        element.object = object;
        element.place = placeOf(object);
        element.seen = seenOf(object, shown);
    }
    for (Evas_Object* member : membersOf(object)) {
        readInto(element, member, shown);
    }
    parts_.nameParts(object, element);
    readParts(element, object, shown);
    if (!widgetsOwn && (holdsSomething(own) || isRow(own))) {
        parent.children.push_back(std::move(own));
    }
}

void ScreenReader::readParts(Element& element, Evas_Object* themed, bool shown) {
    for (const auto& [name, holdsContent] : parts_.groupOf(themed).changing) {
        const char* part = name.c_str();
        const Evas_Object* content = holdsContent ? edje_object_part_swallow_get(themed, part) : nullptr;
        // EFL hands it out as const; only its clips are asked for.
        auto* object = const_cast<Evas_Object*>(content ? content : edje_object_part_object_get(themed, part));
        if (object) {
            element.parts.push_back({name, orEmpty(edje_object_part_state_get(themed, part, nullptr)), placeOf(object),
                                     seenOf(object, shown && evas_object_visible_get(object))});
        }
    }
}

void ScreenReader::readText(Element& parent, Evas_Object* object, const std::string& text, bool shown) {
    if (!text.empty()) {
        parent.texts.push_back({"", text, placeOf(object), seenOf(object, shown), object});
    }
}

void ScreenReader::readStack(Element& element, Evas_Object* naviframe) {
    const std::unique_ptr<Eina_List, ListFree> items(elm_naviframe_items_get(naviframe));
    const Elm_Object_Item* top = elm_naviframe_top_item_get(naviframe);
    for (const Eina_List* node = items.get(); node; node = eina_list_next(node)) {
        auto* item = static_cast<Elm_Object_Item*>(eina_list_data_get(node));
        const Evas_Object* content = elm_object_item_part_content_get(item, "elm.swallow.content");
        element.items.push_back({plainText(orEmpty(elm_object_item_part_text_get(item, "elm.text.title"))),
                                 content ? orEmpty(evas_object_name_get(content)) : "", item == top});
    }
}

}  // namespace

std::vector<Element> readScreen(Evas_Object* window) {
    return ScreenReader(window).read();
}

}  // namespace remote_control
