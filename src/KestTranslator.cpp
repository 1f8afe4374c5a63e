#include "KestTranslator.h"

#include "KestPaths.h"
#include "KestPlatformString.h"
#include "KestTextDomain.h"
#include "KestVconfKeys.h"

#include <libintl.h>
#include <vconf.h>

namespace {

const char ownDomain[] = "kest";
const char systemDomain[] = "sys_string";

}  // namespace

KestTranslator::KestTranslator() : hasDisplayLanguage(false) {}

bool KestTranslator::knows(const std::string& id, const std::string& domain) const {
    // The text of the empty id is the header of the gettext catalogue.
    if (id.empty()) {
        return false;
    }
    if (KestTextDomain::hasText(domain, id) || KestTextDomain::hasText(ownDomain, id) ||
        KestTextDomain::hasText(systemDomain, id)) {
        return true;
    }
    return __findInStrings(id) != nullptr;
}

std::string KestTranslator::translate(const std::string& id, const std::string& domain) const {
    KestTextDomain::bind(domain, kest_paths::locale);
    if (KestTextDomain::hasText(ownDomain, id)) {
        return dgettext(ownDomain, id.c_str());
    }
    KestTextDomain::bind(domain, kest_paths::systemLocale);
    if (KestTextDomain::hasText(domain, id)) {
        return dgettext(domain.c_str(), id.c_str());
    }
    if (KestTextDomain::hasText(systemDomain, id)) {
        return dgettext(systemDomain, id.c_str());
    }
    const std::string* value = __findInStrings(id);
    return value ? *value : id;
}

const std::string* KestTranslator::__findInStrings(const std::string& id) const {
    if (!hasDisplayLanguage) {
        const KestPlatformString language(vconf_get_str(kest_vconf_keys::displayLanguage));
        if (!language) {
            return nullptr;
        }
        displayLanguage = language.str();
        hasDisplayLanguage = true;
    }
    return stringTable.find(displayLanguage, id);
}
