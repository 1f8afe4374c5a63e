#pragma once

#include "support/TemporaryFolder.h"

#include <filesystem>
#include <string>
#include <utility>
#include <vector>

/// Writes the three kinds of catalogue file.
namespace kest_files {

inline constexpr char xmlHead[] = "<?xml version=\"1.0\" encoding=\"UTF-8\"?>\n";

/// One menu of the main menu file.
struct Menu {
    std::string path = "contents/tip.xml";
    std::string appid = "com.ravella.kest";
    std::string state = "Global";

    std::string xml() const {
        return "<menu><path>" + path + "</path><appid>" + appid + "</appid><state>" + state + "</state></menu>\n";
    }
};

/// `menus` are the elements within "menus".
inline std::string mainMenu(const std::string& menus) {
    return std::string(xmlHead) + "<tips>\n<menus>\n" + menus + "</menus>\n</tips>\n";
}
inline std::string mainMenu(const std::vector<Menu>& menus) {
    std::string elements;
    for (const Menu& menu : menus)
        elements += menu.xml();
    return mainMenu(elements);
}

/// `item` is what stands within the one "item".
inline std::string detail(const std::string& item) {
    return std::string(xmlHead) + "<tip>\n<items>\n<item>\n" + item + "</item>\n</items>\n</tip>\n";
}

/// Markup as the text of an element.
inline std::string cdata(const std::string& markup) {
    return "<![CDATA[" + markup + "]]>";
}
inline std::string contents(const std::string& markup) {
    return "<contents>" + cdata(markup) + "</contents>\n";
}
inline std::string textTag(const std::string& id) {
    return "<text id=\"" + id + "\">fallback</text>";
}

struct String {
    std::string region;
    std::string id;
    std::string value;
};
inline std::string strings(const std::vector<String>& all) {
    std::string text = std::string(xmlHead) + "<strings>\n<items>\n";
    for (const String& each : all)
        text += "<item><region>" + each.region + "</region><stringid>" + each.id + "</stringid><value>" +
                cdata(each.value) + "</value></item>\n";
    return text + "</items>\n</strings>\n";
}

}  // namespace kest_files
