#include "TreeJson.h"

#include "Element.h"

#include <Elementary.h>
#include <nlohmann/json.hpp>

namespace remote_control {

namespace {

using Json = nlohmann::ordered_json;

Json jsonOf(const Element& element);

void putPlace(Json& json, const Rectangle& place, const Rectangle& seen) {
    json["x"] = place.x;
    json["y"] = place.y;
    json["width"] = place.width;
    json["height"] = place.height;
    json["visible"] = !seen.empty();
}

void putUnlessEmpty(Json& json, const char* key, const std::string& value) {
    if (!value.empty()) {
        json[key] = value;
    }
}

void putContents(Json& json, const Element& element) {
    for (const Text& text : element.texts) {
        Json entry;
        putUnlessEmpty(entry, "part", text.part);
        entry["text"] = text.text;
        putPlace(entry, text.place, text.seen);
        json["texts"].push_back(std::move(entry));
    }
    for (const Part& part : element.parts) {
        Json entry{{"part", part.name}, {"state", part.state}};
        putPlace(entry, part.place, part.seen);
        json["parts"].push_back(std::move(entry));
    }
    for (const StackItem& item : element.items) {
        json["items"].push_back({{"title", item.title}, {"view", item.view}, {"top", item.top}});
    }
    for (const Row& row : element.rows) {
        Json entry{{"index", row.index}, {"style", row.style}};
        putPlace(entry, row.element.place, row.element.seen);
        putContents(entry, row.element);
        json["rows"].push_back(std::move(entry));
    }
    for (const Element& child : element.children) {
        json["children"].push_back(jsonOf(child));
    }
}

Json jsonOf(const Element& element) {
    Json json{{"type", element.type}};
    putUnlessEmpty(json, "name", element.name);
    putUnlessEmpty(json, "style", element.style);
    putUnlessEmpty(json, "group", element.group);
    putUnlessEmpty(json, "file", element.file);
    putUnlessEmpty(json, "part", element.part);
    putPlace(json, element.place, element.seen);
    if (element.pages.current > 0) {
        json["page"] = element.pages.current;
        json["pages"] = element.pages.count;
    }
    putContents(json, element);
    return json;
}

}  // namespace

std::string treeOf(Evas_Object* window) {
    Json json;
    const char* title = elm_win_title_get(window);
    json["title"] = title ? title : "";
    int width = 0;
    int height = 0;
    evas_output_size_get(evas_object_evas_get(window), &width, &height);
    json["width"] = width;
    json["height"] = height;
    json["elements"] = Json::array();
    for (const Element& element : readScreen(window)) {
        json["elements"].push_back(jsonOf(element));
    }
    return json.dump(-1, ' ', false, Json::error_handler_t::replace);
}

}  // namespace remote_control
