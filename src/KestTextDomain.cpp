#include "KestTextDomain.h"

#include <libintl.h>

namespace {

const size_t longestName = 200;

bool isDomain(const std::string& domain) {
    return domain.size() <= longestName && domain.find('/') == std::string::npos;
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
