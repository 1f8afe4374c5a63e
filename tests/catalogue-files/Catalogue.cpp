#include "Catalogue.h"

#include "Xml.h"
#include "support/TemporaryFolder.h"

#include <libxml/parser.h>
#include <stdexcept>

namespace catalogue {
namespace fs = std::filesystem;

namespace {

Line lineOf(const xmlNode* element) {
    return {textOf(element), element ? xmlGetLineNo(element) : 0};
}

Line idOf(const xmlNode* element) {
    return {attributeOf(element, "id"), element ? xmlGetLineNo(element) : 0};
}

xmlNode* itemsOf(const Document& document) {
    return childNamed(xmlDocGetRootElement(document.get()), "items");
}

void addPackages(std::map<std::string, fs::path>& found, const fs::path& folder) {
    for (const fs::directory_entry& entry : fs::directory_iterator(folder)) {
        if (fs::exists(entry.path() / "tizen-manifest.xml"))
            found[entry.path().filename()] = entry.path();
    }
}

std::string read(const fs::path& file) {
    if (!fs::is_regular_file(file))
        throw std::runtime_error(file.string() + ": no such file");
    return support::readFile(file);
}

}  // namespace

Detail readDetail(const std::string& text, const std::string& name) {
    const Document document = readDocument(text, name);
    const xmlNode* item = childNamed(itemsOf(document), "item");
    Detail detail;
    detail.file = name;
    detail.titleId = idOf(childNamed(item, "title"));
    detail.title = textOf(childNamed(item, "title"));
    detail.appNameId = idOf(childNamed(item, "appname"));
    detail.image = lineOf(childNamed(item, "image"));
    detail.launchAppid = lineOf(childNamed(item, "launchappid"));
    detail.contents = lineOf(childNamed(item, "contents"));
    for (const xmlNode* attach : childrenNamed(item, "attach"))
        detail.attachments.push_back({attributeOf(attach, "id"), lineOf(attach)});
    return detail;
}

StringFile readStrings(const std::string& text, const std::string& name) {
    const Document document = readDocument(text, name);
    StringFile file{name, {}};
    for (const xmlNode* item : childrenNamed(itemsOf(document), "item")) {
        file.strings.push_back({textOf(childNamed(item, "region")), textOf(childNamed(item, "stringid")),
                                textOf(childNamed(item, "value")), xmlGetLineNo(item)});
    }
    return file;
}

std::map<std::string, fs::path> packages(const fs::path& project) {
    std::map<std::string, fs::path> found;
    addPackages(found, project / "examples");
    addPackages(found, project / "packages");
    return found;
}

std::vector<Tip> readCatalogue(const fs::path& project) {
    const std::map<std::string, fs::path> known = packages(project);
    const Document menus = readDocument(project / "shared/res/contents/kest_menu.xml");
    std::vector<Tip> tips;
    for (const xmlNode* menu : childrenNamed(childNamed(xmlDocGetRootElement(menus.get()), "menus"), "menu")) {
        Tip tip;
        tip.path = textOf(childNamed(menu, "path"));
        tip.appid = textOf(childNamed(menu, "appid"));
        tip.state = textOf(childNamed(menu, "state"));
        tip.line = xmlGetLineNo(menu);
        const auto package = known.find(tip.appid);
        const fs::path root = package == known.end() ? project : package->second;
        tip.everywhere = root.parent_path() != project / "examples";
        tip.sharedResources = root / "shared/res";
        const fs::path detail = tip.sharedResources / tip.path;
        tip.detail = readDetail(read(detail), fs::relative(detail, project));
        const fs::path strings = detail.parent_path() / (detail.stem().string() + "-string.xml");
        tip.strings.file = fs::relative(strings, project);
        if (fs::exists(strings))
            tip.strings = readStrings(read(strings), tip.strings.file);
        tips.push_back(std::move(tip));
    }
    return tips;
}

}  // namespace catalogue
