#include "kest/Texts.h"

#include "KestPaths.h"

#include <libintl.h>

#include <clocale>
#include <cstdlib>

extern "C" {
/// The C library's own counter: texts that it has looked up before are looked up anew when it changes.
extern int _nl_msg_cat_cntr;

char* __real_bindtextdomain(const char* domain, const char* folder);
char* __wrap_bindtextdomain(const char* domain, const char* folder);
}

namespace {

std::vector<std::pair<std::string, std::string>> bound;

void bindToSystem(const char* domain) {
    __real_bindtextdomain(domain, TEST_SYSTEM_LOCALE);
    bind_textdomain_codeset(domain, "UTF-8");
}

}  // namespace

char* __wrap_bindtextdomain(const char* domain, const char* folder) {
    if (folder)
        bound.emplace_back(domain, folder);
    const bool isSystem = folder && std::string(folder) == kest_paths::systemLocale;
    return __real_bindtextdomain(domain, isSystem ? TEST_SYSTEM_LOCALE : folder);
}

namespace kest_texts {

std::filesystem::path systemLocale() {
    return TEST_SYSTEM_LOCALE;
}

void start(const std::string& language) {
    __real_bindtextdomain("kest", kest_paths::locale);
    bind_textdomain_codeset("kest", "UTF-8");
    // Where the C library looks for a domain that nobody has bound.
    for (const char* domain : {"tips", "sys_string", "contacts"})
        bindToSystem(domain);
    useLanguage(language);
    bound.clear();
}

void useLanguage(const std::string& language) {
    setenv("LANGUAGE", language.substr(0, language.find('.')).c_str(), 1);
    std::setlocale(LC_ALL, "C.UTF-8");
    ++_nl_msg_cat_cntr;
}

const std::vector<std::pair<std::string, std::string>>& bindings() {
    return bound;
}

}  // namespace kest_texts
