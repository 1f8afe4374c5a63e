#include "Original.h"

#include <Elementary.h>

#include <string>

namespace {

bool isExtension(const Elm_Theme* theme, const std::string& file) {
    const Eina_List* node = nullptr;
    void* each = nullptr;
    EINA_LIST_FOREACH(elm_theme_extension_list_get(theme), node, each) {
        if (file == static_cast<const char*>(each))
            return true;
    }
    return false;
}

}  // namespace

/// Every view adds the application's theme file when it is made. EFL would keep the file once more each time, search
/// it once more for every group, and theme all widgets anew.
extern "C" void elm_theme_extension_add(Elm_Theme* theme, const char* file) {
    if (!file || isExtension(theme, file))
        return;
    static const auto add = efl_answers::original<void(Elm_Theme*, const char*)>("elm_theme_extension_add");
    if (add)
        add(theme, file);
}
