#include "Catalogue.h"

namespace bench {
namespace {

constexpr int applications = 10;
constexpr const char* texts[] = {"INTRO", "SIDEWAYS", "DOWN", "KEY", "OPEN"};

std::string appId(int number) {
    return "com.example.app" + std::to_string(number % applications);
}

std::string pagePath(int number) {
    return "contents/page" + std::to_string(number) + ".xml";
}

std::string menuFile(int menus) {
    std::string xml = "<?xml version=\"1.0\" encoding=\"utf-8\"?>\n<kest>\n    <menus>\n";
    for (int number = 0; number < menus; ++number) {
        xml += "        <menu>\n            <path>" + pagePath(number) + "</path>\n            <appid>" +
               appId(number) + "</appid>\n            <state>Global,India,Russia,Indonesia,SWA,Africa</state>\n" +
               "        </menu>\n";
    }
    return xml + "    </menus>\n</kest>\n";
}

std::string page(int number) {
    const std::string id = "IDS_PAGE" + std::to_string(number) + "_";
    std::string xml = "<?xml version=\"1.0\" encoding=\"utf-8\"?>\n<detail>\n    <items>\n        <item>\n"
                      "            <textdomain>com.example.page</textdomain>\n            <title id=\"" +
                      id +
                      "TITLE\">Find your way with one finger</title>\n            <appname>Application</appname>\n"
                      "            <launchappid>com.ravella.settings</launchappid>\n"
                      "            <launchparamkey>page</launchparamkey>\n"
                      "            <launchparamvalue>gestures</launchparamvalue>\n            <contents><![CDATA[";
    for (const char* text : texts) {
        xml += "<text id=\"" + id + text + "\"></text>\n<br/><font_size=16><br/></font_size>";
    }
    return xml + "]]></contents>\n        </item>\n    </items>\n</detail>\n";
}

void addString(std::string& xml, const char* language, const std::string& id, const char* value) {
    xml += std::string("        <item>\n            <region>") + language + "</region>\n            <stringid>" + id +
           "</stringid>\n            <value><![CDATA[" + value + "]]></value>\n        </item>\n";
}

std::string strings(int number) {
    const std::string id = "IDS_PAGE" + std::to_string(number) + "_";
    std::string xml = "<?xml version=\"1.0\" encoding=\"utf-8\"?>\n<strings>\n    <items>\n";
    for (const char* language : {"en", "ko", "ru"}) {
        addString(xml, language, id + "TITLE", "Find your way with one finger");
        for (const char* text : texts) {
            addString(xml, language, id + text, "<b>Swipe down from the top</b> to open the quick settings.");
        }
    }
    return xml + "    </items>\n</strings>\n";
}

}  // namespace

Catalogue::Catalogue(int menus) : device_("com.ravella.kest") {
    for (int number = 0; number < applications; ++number) {
        device_.addPackage(appId(number));
    }
    files_.push_back(device_.appRoot() / "shared/res/contents/kest_menu.xml");
    support::writeFile(files_.front(), menuFile(menus));
    for (int number = 0; number < menus; ++number) {
        addPage(number, appId(number));
    }
}

void Catalogue::addPage(int number, const std::string& appId) {
    std::filesystem::path file = device_.preinstalled() / appId / "shared/res" / pagePath(number);
    const std::filesystem::path stringFile = file.parent_path() / ("page" + std::to_string(number) + "-string.xml");
    support::writeFile(stringFile, strings(number));
    support::writeFile(file, page(number));
    files_.push_back(stringFile);
    files_.push_back(std::move(file));
}

}  // namespace bench
