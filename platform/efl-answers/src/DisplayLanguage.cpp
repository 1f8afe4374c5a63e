#include "efl-answers/DisplayLanguage.h"

#include <libintl.h>
#include <locale.h>
#include <unicode/uchar.h>
#include <unicode/uloc.h>
#include <unicode/uscript.h>

#include <algorithm>
#include <cctype>
#include <cstdlib>

/// gettext's own counter of changes to its catalogues. It keeps the texts it gave and looks at LANGUAGE anew only
/// when this has moved; setting the same locale again would not do.
extern "C" int _nl_msg_cat_cntr;

namespace {

constexpr char codeset[] = ".UTF-8";
/// Every Debian has it, and unlike in "C" gettext translates in it.
constexpr char anyLocale[] = "C.UTF-8";

bool isWord(const std::string& text) {
    return std::all_of(text.begin(), text.end(), [](unsigned char c) { return std::isalnum(c) || c == '_'; });
}

bool exists(const std::string& locale) {
    const locale_t made = newlocale(LC_ALL_MASK, locale.c_str(), nullptr);
    if (made)
        freelocale(made);
    return made != nullptr;
}

}  // namespace

DisplayLanguage::DisplayLanguage(const std::string& name) {
    const auto at = name.find('@');
    const std::string modifier = at == std::string::npos ? "" : name.substr(at + 1);
    const std::string language = name.substr(0, std::min(at, name.find('.')));
    if (language == "C" || language == "POSIX" || language.empty() || !isWord(language) || !isWord(modifier))
        return;
    name_ = modifier.empty() ? language : language + "@" + modifier;
}

std::string DisplayLanguage::locale() const {
    if (name_.empty())
        return anyLocale;
    const auto at = std::min(name_.find('@'), name_.size());
    const std::string wanted = name_.substr(0, at) + codeset + name_.substr(at);
    return exists(wanted) ? wanted : anyLocale;
}

bool DisplayLanguage::isRightToLeft() const {
    const auto at = std::min(name_.find('@'), name_.size());
    // A modifier may name another script than the language's usual one.
    const std::string modifier = name_.substr(std::min(at + 1, name_.size()));
    const int script = u_getPropertyValueEnum(UCHAR_SCRIPT, modifier.c_str());
    if (script != UCHAR_INVALID_CODE)
        return uscript_isRightToLeft(static_cast<UScriptCode>(script));
    return uloc_isRightToLeft(name_.substr(0, at).c_str());
}

void DisplayLanguage::use() const {
    setenv("LANGUAGE", name_.c_str(), 1);
    ++_nl_msg_cat_cntr;
    setlocale(LC_ALL, locale().c_str());
}

void DisplayLanguage::bindTexts(const std::string& domain, const std::string& folder) {
    bindtextdomain(domain.c_str(), folder.c_str());
    bind_textdomain_codeset(domain.c_str(), "UTF-8");
}
