#include "Texts.h"

#include <algorithm>
#include <clocale>
#include <cstdlib>
#include <filesystem>
#include <libintl.h>

// gettext keeps what it found for a language until this counter moves.
extern "C" int _nl_msg_cat_cntr;

namespace catalogue {
namespace {

void bindDomains() {
    setlocale(LC_ALL, "C.UTF-8");
    bindtextdomain("kest", APPLICATION_TEXTS);
    bindtextdomain("sys_string", DEVICE_TEXTS);
    for (const char* domain : {"kest", "sys_string"})
        bind_textdomain_codeset(domain, "UTF-8");
}

}  // namespace

std::optional<std::string> sharedText(const std::string& language, const std::string& id) {
    static const bool bound = (bindDomains(), true);
    static_cast<void>(bound);
    setenv("LANGUAGE", language.c_str(), 1);
    ++_nl_msg_cat_cntr;
    for (const char* domain : {"kest", "sys_string"}) {
        const std::string text = dgettext(domain, id.c_str());
        if (text != id)
            return text;
    }
    return std::nullopt;
}

std::vector<std::string> languagesIn(const std::string& folder) {
    std::vector<std::string> languages;
    for (const std::filesystem::directory_entry& entry : std::filesystem::directory_iterator(folder)) {
        if (entry.is_directory())
            languages.push_back(entry.path().filename());
    }
    std::sort(languages.begin(), languages.end());
    return languages;
}

}  // namespace catalogue
