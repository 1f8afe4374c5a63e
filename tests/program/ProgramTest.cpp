#include "ProgramTest.h"

#include <libxml/parser.h>

#include <memory>

namespace {

using Json = nlohmann::json;

/// The first visible element of that type.
Json findVisible(const Json& elements, const std::string& type) {
    for (const Json& element : elements) {
        if (element["type"] == type && element["visible"] == true) {
            return element;
        }
        if (Json below = findVisible(element.value("children", Json::array()), type); !below.is_null()) {
            return below;
        }
    }
    return nullptr;
}

std::string textIn(const Json& element, const std::string& part) {
    for (const Json& text : element.value("texts", Json::array())) {
        if (text.value("part", "") == part) {
            return text["text"];
        }
    }
    return {};
}

/// Whether a picture that is there is shown somewhere below.
bool showsPicture(const Json& element) {
    for (const Json& child : element.value("children", Json::array())) {
        if ((child["type"] == "Elm_Image" && std::filesystem::exists(child.value("file", ""))) || showsPicture(child)) {
            return true;
        }
    }
    return false;
}

struct DocumentFree {
    void operator()(xmlDoc* document) const { xmlFreeDoc(document); }
};

std::string childText(const xmlNode* node, const char* name) {
    for (const xmlNode* child = node->children; child; child = child->next) {
        if (xmlStrEqual(child->name, BAD_CAST name)) {
            const std::unique_ptr<xmlChar, decltype(xmlFree)> text(xmlNodeGetContent(child), xmlFree);
            return reinterpret_cast<const char*>(text.get());
        }
    }
    return {};
}

}  // namespace

Json ProgramTest::list() {
    return findVisible(device_.json({"tree"})["elements"], "Elm_Genlist");
}

std::string ProgramTest::titleRow() {
    const Json shown = list();
    return shown.is_null() || shown["rows"].empty() ? "" : textIn(shown["rows"][0], "elm.text.main");
}

std::vector<ListRow> ProgramTest::rows() {
    std::vector<ListRow> found;
    const Json shown = list();
    for (std::size_t i = 1; !shown.is_null() && i < shown["rows"].size(); ++i) {
        const Json& row = shown["rows"][i];
        found.push_back(
            {textIn(row, "elm.text.sub.left.top"), textIn(row, "elm.text.main.left.bottom"), showsPicture(row)});
    }
    return found;
}

std::vector<std::string> ProgramTest::titles() {
    std::vector<std::string> found;
    for (const ListRow& row : rows()) {
        found.push_back(row.bottom);
    }
    return found;
}

std::string ProgramTest::titleBar() {
    const Json stack = findVisible(device_.json({"tree"})["elements"], "Elm_Naviframe");
    return stack.is_null() || stack["items"].empty() ? "" : stack["items"].back().value("title", "");
}

std::vector<std::string> ProgramTest::logged(const std::string& text) {
    std::vector<std::string> found;
    std::istringstream log(device_.must({"log", "--tag", "KEST", "--json"}));
    for (std::string line; std::getline(log, line);) {
        const Json entry = Json::parse(line);
        const std::string whole = entry["message"];
        // After the source file, the function and the line.
        const std::string message = whole.substr(whole.find(" > ") + 3);
        if (message.find(text) != std::string::npos) {
            found.push_back(entry["level"].get<std::string>() + " " + message);
        }
    }
    return found;
}

std::vector<std::string> menusOfferedIn(const std::string& region) {
    std::vector<std::string> menus;
    const std::unique_ptr<xmlDoc, DocumentFree> document(xmlReadFile(MAIN_MENU, "utf-8", 0));
    for (const xmlNode* group = xmlDocGetRootElement(document.get())->children; group; group = group->next) {
        for (const xmlNode* menu = group->children; menu; menu = menu->next) {
            const bool installed = childText(menu, "appid") != "com.ravella.sleep";
            if (installed && childText(menu, "state").find(region) != std::string::npos) {
                menus.push_back(childText(menu, "path"));
            }
        }
    }
    return menus;
}

int menuOf(const std::string& file, const std::string& region) {
    const std::vector<std::string> menus = menusOfferedIn(region);
    return static_cast<int>(std::ranges::find(menus, file) - menus.begin());
}

std::filesystem::path makeSleepPackage(const std::filesystem::path& where) {
    test_tool::makePackage(where, "com.ravella.sleep", "1.0");
    support::writeFile(where / "shared/res/contents/sleep_night.xml",
                       "<?xml version=\"1.0\" encoding=\"utf-8\"?>\n<detail><items><item><title>Sleep tight</title>"
                       "<appname>Sleep</appname><contents>Good night</contents></item></items></detail>\n");
    return where;
}
