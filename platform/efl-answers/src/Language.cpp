#include "Original.h"

#include "efl-answers/DisplayLanguage.h"

#include <Elementary.h>

/// EFL takes the name as a locale of the C library. A device has all of its languages; a workstation may have none of
/// them, or "ko_KR" in another character set. So the language is made the process's own way first, and EFL gets the
/// name of a locale that exists. NULL asks EFL to translate anew in the language that is.
extern "C" void elm_language_set(const char* language) {
    static const auto set = efl_answers::original<void(const char*)>("elm_language_set");
    if (!set)
        return;
    if (!language) {
        set(nullptr);
        return;
    }
    const DisplayLanguage wanted(language);
    wanted.use();
    set(wanted.locale().c_str());
}
