#include "KestContentMgr.h"

#include "KestContentCache.h"
#include "KestLog.h"
#include "KestMarkup.h"
#include "KestMenuElement.h"
#include "KestPackageInfo.h"
#include "KestPaths.h"
#include "KestPlatformString.h"
#include "KestTextGrowth.h"
#include "KestTextTags.h"
#include "KestVconfKeys.h"
#include "KestXmlDocument.h"

#include <unistd.h>
#include <vconf.h>

namespace {

const char menuFile[] = "contents/kest_menu.xml";

/// More menus than anybody scrolls through; only files that go wrong have them.
const size_t mostMenus = 20000;

}  // namespace

KestContentMgr* KestContentMgr::getInstance() {
    static KestContentMgr instance;
    return &instance;
}

KestContentMgr::KestContentMgr() {
    KEST_BEGIN();
    loadContentsList(false);
}

KestContentMgr::~KestContentMgr() {
    KEST_BEGIN();
}

bool KestContentMgr::loadContentsList(bool force) {
    KEST_BEGIN();
    contentsList.clear();
    sharedResources.forget();
    work = KestLoadWork();
    if (!__loadMainMenu()) {
        KEST_INFO("__loadMainMenu failed");
        return false;
    }
    if (!force && __checkCacheAvailable()) {
        for (KestContentInfo& record : contentsList) {
            if (work.keepsMore()) {
                __getFromPreference(record.path, record);
                __keep(record);
            }
            record.iconPath = __getIconPath(record.appid);
        }
        return true;
    }

    // Until the load has finished no version is right, so one that is cut short leaves the cache invalid.
    KestContentCache::writeVersion("");
    const KestPlatformString language(vconf_get_str(kest_vconf_keys::displayLanguage));
    translator.forgetLanguage();
    if (language) {
        KestContentCache::writeLanguage(language.str());
    }
    for (KestContentInfo& record : contentsList) {
        if (!__loadDetailMenu(record)) {
            KEST_INFO("__loadDetailMenu failed : %s", record.appid.empty() ? "Unknown" : record.appid.c_str());
        }
    }
    const std::string version = __getPackageVersion();
    if (!version.empty()) {
        KestContentCache::writeVersion(version);
    }
    return true;
}

bool KestContentMgr::__loadMainMenu() {
    KEST_BEGIN();
    const std::string path = sharedResources.of(KEST_APP_ID) + menuFile;
    const int accessible = access(path.c_str(), F_OK);
    if (accessible != 0) {
        KEST_ERR("Failed to access: %d, %s", accessible, path.c_str());
        return false;
    }
    KestXmlDocument document;
    if (!document.read(path, work)) {
        KEST_ERR("%s", document.failure());
        return false;
    }
    const xmlNode* menus = document.findSection("menus");
    size_t offered = 0;
    for (xmlNode* menu = menus ? menus->children : nullptr; menu; menu = menu->next) {
        if (!KestXmlDocument::isElement(menu, "menu")) {
            continue;
        }
        const KestContentInfo record = KestMenuElement::read(menu);
        if (!record.isAvailable) {
            continue;
        }
        if (++offered > mostMenus) {
            KEST_WARN("only the first %zu menus are read", mostMenus);
            break;
        }
        if (access(__detailPath(record).c_str(), F_OK) == 0) {
            contentsList.push_back(record);
        } else {
            KEST_WARN("__loadMainMenu failed : %s", record.appid.c_str());
        }
    }
    return true;
}

bool KestContentMgr::__loadDetailMenu(KestContentInfo& record) {
    KEST_BEGIN();
    work.beginDetail();
    __loadStringResource(record);
    const std::string path = __detailPath(record);
    const int accessible = access(path.c_str(), F_OK);
    if (accessible != 0) {
        KEST_ERR("Failed to access: %d, %s", accessible, path.c_str());
        return false;
    }
    KestXmlDocument document;
    if (!document.read(path, work)) {
        KEST_ERR("%s", document.failure());
        return false;
    }
    record.menuTitle = "No Title";
    record.textContents = "No Contents";
    record.iconPath = __getIconPath(record.appid);

    const xmlNode* items = document.findSection("items");
    for (const xmlNode* item = items ? items->children : nullptr; item; item = item->next) {
        if (!KestXmlDocument::isElement(item, "item")) {
            continue;
        }
        for (xmlNode* node = item->children; node; node = node->next) {
            if (!KestXmlDocument::isElement(node, "contents")) {
                __readDetail(node, record);
                continue;
            }
            const std::string text = KestXmlDocument::str(KestXmlDocument::content(node));
            const bool oldStyle = KestMarkup::find(text, record.titleId, 0) != std::string::npos;
            if (oldStyle) {
                KEST_INFO("Old xml style, Need to manipulate");
            }
            __setContents(record, text, oldStyle ? KestMarkup::cleanOldContents(text) : text);
        }
    }
    __saveToPreference(record);
    __keep(record);
    return true;
}

void KestContentMgr::__keep(KestContentInfo& record) {
    // What is kept is charged by its length; what the replacements left reserved could be as much again.
    record.textContents.shrink_to_fit();
    if (!work.spendOnKeeping(KestContentCache::sizeOf(record))) {
        KEST_WARN("too much text: %s", record.path.c_str());
        KestContentCache::dropTexts(record);
    }
}

void KestContentMgr::__readDetail(xmlNode* node, KestContentInfo& record) {
    const KestXmlDocument::Text content = KestXmlDocument::content(node);
    const std::string text = KestXmlDocument::str(content);
    if (KestXmlDocument::isElement(node, "textdomain")) {
        record.textdomain = text;
    } else if (KestXmlDocument::isElement(node, "title")) {
        std::string id;
        record.menuTitle = __translateById(node, record.textdomain, text, id);
        if (!id.empty()) {
            record.titleId = id;
        }
    } else if (KestXmlDocument::isElement(node, "appname")) {
        std::string id;
        record.appName = __translateById(node, record.textdomain, text, id);
    } else if (KestXmlDocument::isElement(node, "image")) {
        record.imagePath = sharedResources.of(record.appid) + text;
    } else if (KestXmlDocument::isElement(node, "launchappid")) {
        record.launchAppid = text;
    } else if (KestXmlDocument::isElement(node, "launchparamkey")) {
        record.launchParamKey = text;
    } else if (KestXmlDocument::isElement(node, "launchparamvalue")) {
        record.launchParamValue = text;
    } else if (KestXmlDocument::isElement(node, "attach")) {
        const KestXmlDocument::Text id = KestXmlDocument::attribute(node, "id");
        if (content && id) {
            KestTextGrowth::attach(record, KestXmlDocument::str(id), __convertHrefPath(record.appid, text), work);
        }
    }
}

std::string KestContentMgr::__translateById(xmlNode* node, const std::string& domain, const std::string& text,
                                            std::string& usedId) {
    const KestXmlDocument::Text id = KestXmlDocument::attribute(node, "id");
    const std::string name = KestXmlDocument::str(id);
    if (!id || !work.spendOnText(0) || !__isStringAvailable(name, domain)) {
        return text;
    }
    std::string translation = __getString(name, domain);
    if (!work.spendOnText(KestLoadWork::ofTranslating(translation.size()))) {
        return text;
    }
    usedId = name;
    return translation;
}

void KestContentMgr::__setContents(KestContentInfo& record, const std::string& text, const std::string& cleaned) {
    record.textContents = __convertHrefPath(record.appid, __translateContents(record.textdomain, cleaned));
    if (record.textContents.empty()) {
        record.textContents = text;
    }
}

std::string KestContentMgr::__convertHrefPath(const std::string& appid, const std::string& text) {
    return KestTextGrowth::withAbsolutePaths(text, sharedResources.of(appid), work);
}

void KestContentMgr::__loadStringResource(const KestContentInfo& record) {
    KEST_BEGIN();
    const std::string path = __replaceString(__detailPath(record), ".xml", "-string.xml", true);
    if (access(path.c_str(), F_OK) != 0) {
        return;
    }
    KEST_INFO("%s use self string resource", record.appid.c_str());
    KestXmlDocument document;
    if (!document.read(path, work)) {
        KEST_ERR("%s", document.failure());
        return;
    }
    if (const xmlNode* items = document.findSection("items")) {
        translator.strings().addAll(items);
    }
}

std::string KestContentMgr::__translateContents(const std::string& domain, const std::string& contents) {
    KestTextTags tags(contents, work);
    for (std::string tag = tags.first(); !tag.empty(); tag = tags.first()) {
        const std::string id = __extractString(tag, "id=\"", "\">", false);
        if (id.empty()) {
            KEST_INFO("xml contents error: text id string part");
            return __extractString(tag, ">", "<", false);
        }
        const std::string value = work.spendOnText(tag.size()) ? __getString(id, domain) : "";
        // Markup only makes it longer.
        if (!work.spendOnText(KestLoadWork::ofTranslating(tag.size() + value.size())) ||
            value.size() > KestTextTags::longestContents || !tags.replaceFirst(KestMarkup::fromTranslation(value))) {
            KEST_INFO("xml contents error: text id string part");
            break;
        }
    }
    return tags.result();
}

bool KestContentMgr::__checkCacheAvailable() {
    std::string cachedLanguage;
    if (!KestContentCache::readLanguage(cachedLanguage)) {
        return false;
    }
    const KestPlatformString language(vconf_get_str(kest_vconf_keys::displayLanguage));
    if (!language || language.str() != cachedLanguage) {
        KEST_INFO("Language changed");
        return false;
    }
    std::string cachedVersion;
    if (KestContentCache::readVersion(cachedVersion) && cachedVersion != __getPackageVersion()) {
        KEST_INFO("Version changed!!");
        return false;
    }
    return true;
}

std::string KestContentMgr::__getPackageVersion() {
    const KestPackageInfo package(package_manager_get_package_info, KEST_APP_ID);
    if (package.result() != PACKAGE_MANAGER_ERROR_NONE) {
        KEST_WARN("package_manager_get_package_info error");
        return "";
    }
    KestPlatformString version;
    package_info_get_version(package.handle(), version.out());
    return version.str();
}

std::string KestContentMgr::__getIconPath(const std::string& appid) {
    if (appid.empty()) {
        return "";
    }
    const KestPackageInfo package(package_info_create, appid);
    if (package.result() != PACKAGE_MANAGER_ERROR_NONE) {
        KEST_ERR("package_info_create return [%d]", package.result());
        return "No icon Path";
    }
    KestPlatformString icon;
    const int result = package_info_get_icon(package.handle(), icon.out());
    if (result != PACKAGE_MANAGER_ERROR_NONE || !icon) {
        KEST_ERR("pkgmgrinfo_appinfo_get_icon return [%d]", result);
        return "No icon Path";
    }
    return icon.str();
}

void KestContentMgr::__saveToPreference(const KestContentInfo& record) {
    KEST_HIT();
    KestContentCache::save(record);
}

void KestContentMgr::__getFromPreference(const std::string& path, KestContentInfo& record) {
    KEST_HIT();
    KestContentCache::load(path, record);
}
