#include "KestCommon.h"

#include "KestLog.h"
#include "KestPaths.h"
#include "KestPlatformString.h"
#include "KestVconfKeys.h"

#include <app_common.h>
#include <app_manager.h>
#include <app_resource_manager.h>
#include <libintl.h>
#include <vconf.h>

#include <algorithm>
#include <array>

namespace {

const char ownDomain[] = "kest";
const char fallbackDomain[] = "contacts";
const char edjFile[] = "edje/kest.edj";
const char colorFile[] = "table/com.ravella.kest_ChangeableColorInfo.xml";
const char fontFile[] = "table/com.ravella.kest_ChangeableFontInfo.xml";

/// Follows the device's light or dark theme.
const int changeableStyle = 2;

std::string resolveResource(const char* id) {
    KestPlatformString path;
    app_resource_manager_get(APP_RESOURCE_TYPE_IMAGE, id, path.out());
    return path.str();
}

template <size_t count>
bool contains(const std::array<const char*, count>& codes, const std::string& code) {
    return std::find(codes.begin(), codes.end(), code) != codes.end();
}

}  // namespace

bool KestCommon::setChangeableTable(Evas_Object* obj, uxt_color_table_h* color, uxt_font_table_h* font) {
    KEST_BEGIN();
    const std::string colorPath = resolveResource(colorFile);
    const std::string fontPath = resolveResource(fontFile);
    KEST_INFO("color table path[%s]", colorPath.c_str());
    KEST_INFO("font table path[%s]", fontPath.c_str());

    *color = uxt_theme_add_color_table(colorPath.c_str());
    if (!*color) {
        KEST_ERR("uxt_theme_add_color_table() is failed");
        return false;
    }
    *font = uxt_theme_add_font_table(fontPath.c_str());
    if (!*font) {
        KEST_ERR("uxt_theme_add_font_table() is failed");
        return false;
    }
    if (!obj) {
        uxt_theme_set_changeable_ui_enabled(EINA_TRUE);
        uxt_theme_set_style(changeableStyle);
        uxt_theme_set_color_table(*color);
        uxt_theme_set_font_table(*font);
    } else {
        uxt_theme_object_set_changeable_ui_enabled(obj, EINA_TRUE);
        uxt_theme_object_set_color_table(obj, *color);
        uxt_theme_object_set_style(obj, changeableStyle);
        uxt_theme_object_set_font_table(obj, *font);
    }
    return true;
}

bool KestCommon::unsetChangeableTable(uxt_color_table_h* color, uxt_font_table_h* font) {
    KEST_HIT();
    if (*color) {
        uxt_theme_delete_color_table(*color);
        *color = nullptr;
    }
    if (*font) {
        uxt_theme_delete_font_table(*font);
        *font = nullptr;
    }
    return true;
}

std::string KestCommon::findProperDomain(const std::string& id) {
    if (id.empty()) {
        KEST_ERR("idString empty");
        return "";
    }
    bindtextdomain(ownDomain, kest_paths::locale);
    if (id != dgettext(ownDomain, id.c_str())) {
        return ownDomain;
    }
    bindtextdomain(fallbackDomain, kest_paths::systemLocale);
    return fallbackDomain;
}

std::string KestCommon::translateString(const std::string& id) {
    if (id.empty()) {
        KEST_ERR("idString empty");
        return "";
    }
    const std::string domain = findProperDomain(id);
    const char* text = dgettext(domain.c_str(), id.c_str());
    return text ? text : id;
}

Evas_Object* KestCommon::createButton(Evas_Object* parent, const char* style, const char* text, Evas_Smart_Cb clicked,
                                      void* data) {
    Evas_Object* button = style ? uxt_button_add(parent, style) : elm_button_add(parent);
    if (!button) {
        KEST_ERR("uxt_button_add() is failed");
        return nullptr;
    }
    if (text) {
        elm_object_part_text_set(button, nullptr, text);
    }
    evas_object_size_hint_weight_set(button, EVAS_HINT_EXPAND, EVAS_HINT_EXPAND);
    evas_object_smart_callback_add(button, "clicked", clicked, data);
    evas_object_show(button);
    return button;
}

std::string KestCommon::getEdjFilePath(bool useResourceManager) {
    std::string result;
    if (useResourceManager) {
        result = resolveResource(edjFile);
    } else {
        const KestPlatformString directory(app_get_resource_path());
        if (directory) {
            result = directory.str() + edjFile;
        }
    }
    KEST_INFO("edje resource path[%s]", result.c_str());
    return result;
}

std::string KestCommon::getRegion() {
    const KestPlatformString value(vconf_get_str(kest_vconf_keys::country));
    if (!value) {
        return "Global";
    }
    const std::string country = value.str();
    const std::array<const char*, 3> southWestAsia = {{"BD", "LK", "NP"}};
    const std::array<const char*, 3> africa = {{"ZA", "KE", "NG"}};
    if (country == "IN") {
        return "India";
    }
    if (country == "RU") {
        return "Russia";
    }
    if (country == "ID") {
        return "Indonesia";
    }
    if (contains(southWestAsia, country)) {
        return "SWA";
    }
    return contains(africa, country) ? "Africa" : "Global";
}

bool KestCommon::findSharedResourcePath(const std::string& appid, std::string& path) {
    KestPlatformString answer;
    if (app_manager_get_shared_resource_path(appid.c_str(), answer.out()) != APP_MANAGER_ERROR_NONE || !answer) {
        return false;
    }
    path = answer.str();
    return true;
}

std::string KestCommon::getSharedResourcePath(const std::string& appid) {
    std::string path;
    return findSharedResourcePath(appid, path) ? path : kest_paths::sharedResources;
}
