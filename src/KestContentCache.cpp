#include "KestContentCache.h"

#include "KestPlatformString.h"

#include <app_preference.h>

#include <algorithm>
#include <array>

namespace {

const char languageKey[] = "KestCurrentLanguage";
const char versionKey[] = "KestPackageVersion";

struct CachedField {
    const char* suffix;
    std::string KestContentInfo::*field;
};

const std::array<CachedField, 9> cachedFields = {{
    {"_textdomain", &KestContentInfo::textdomain},
    {"_menuTitle", &KestContentInfo::menuTitle},
    {"_textContents", &KestContentInfo::textContents},
    {"_imagePath", &KestContentInfo::imagePath},
    {"_iconPath", &KestContentInfo::iconPath},
    {"_appName", &KestContentInfo::appName},
    {"_launchAppid", &KestContentInfo::launchAppid},
    {"_launchParamKey", &KestContentInfo::launchParamKey},
    {"_launchParamValue", &KestContentInfo::launchParamValue},
}};

std::string keyBase(const std::string& path) {
    std::string base = path;
    std::replace(base.begin(), base.end(), '/', '_');
    return base;
}

bool readString(const std::string& key, std::string& result) {
    KestPlatformString value;
    if (preference_get_string(key.c_str(), value.out()) != PREFERENCE_ERROR_NONE) {
        return false;
    }
    result = value.str();
    return true;
}

}  // namespace

void KestContentCache::save(const KestContentInfo& record) {
    const std::string base = keyBase(record.path);
    for (const CachedField& cached : cachedFields) {
        preference_set_string((base + cached.suffix).c_str(), (record.*cached.field).c_str());
    }
}

void KestContentCache::load(const std::string& path, KestContentInfo& record) {
    const std::string base = keyBase(path);
    for (const CachedField& cached : cachedFields) {
        std::string value;
        if (readString(base + cached.suffix, value) && !value.empty()) {
            record.*cached.field = value;
        }
    }
}

std::uint64_t KestContentCache::sizeOf(const KestContentInfo& record) {
    std::uint64_t size = 0;
    for (const CachedField& cached : cachedFields) {
        size += (record.*cached.field).size();
    }
    return size;
}

void KestContentCache::dropTexts(KestContentInfo& record) {
    for (const CachedField& cached : cachedFields) {
        if (cached.field != &KestContentInfo::iconPath) {
            std::string().swap(record.*cached.field);
        }
    }
}

bool KestContentCache::readLanguage(std::string& language) {
    return readString(languageKey, language);
}

bool KestContentCache::readVersion(std::string& version) {
    return readString(versionKey, version);
}

void KestContentCache::writeLanguage(const std::string& language) {
    preference_set_string(languageKey, language.c_str());
}

void KestContentCache::writeVersion(const std::string& version) {
    preference_set_string(versionKey, version.c_str());
}
