#include "KestTextDomain.h"

#include <libintl.h>

#include <set>

namespace {

const size_t longestName = 200;

/// gettext keeps every domain that it was ever asked for, in a list that it goes through for each text.
const size_t mostDomains = 256;

bool isDomain(const std::string& domain) {
    // Those that are asked for in every tip have their places.
    static std::set<std::string> known = {"kest", "sys_string"};
    if (domain.size() > longestName || domain.find('/') != std::string::npos) {
        return false;
    }
    return known.count(domain) != 0 || (known.size() < mostDomains && known.insert(domain).second);
}

}  // namespace

bool KestTextDomain::hasText(const std::string& domain, const std::string& id) {
    return isDomain(domain) && id != dgettext(domain.c_str(), id.c_str());
}

void KestTextDomain::bind(const std::string& domain, const char* directory) {
    if (isDomain(domain)) {
        bindtextdomain(domain.c_str(), directory);
    }
}
