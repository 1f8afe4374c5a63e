#include "ThemeParts.h"

#include <Edje.h>
#include <Elementary.h>
// Only this part of EFL can list the parts of a group. It is used for reading, on an object of our own.
#define EDJE_EDIT_IS_UNSTABLE_AND_I_KNOW_ABOUT_IT
#include <Edje_Edit.h>

#include <cstdlib>
#include <memory>
#include <sstream>
#include <string_view>

namespace remote_control {

namespace {

struct ObjectDelete {
    void operator()(Evas_Object* object) const { evas_object_del(object); }
};
using Object = std::unique_ptr<Evas_Object, ObjectDelete>;

struct NamesFree {
    void operator()(Eina_List* names) const { edje_edit_string_list_free(names); }
};
using Names = std::unique_ptr<Eina_List, NamesFree>;

struct Free {
    void operator()(char* text) const { std::free(text); }
};

unsigned countStates(Evas_Object* reader, const char* part) {
    const Names states(edje_edit_part_states_list_get(reader, part));
    return eina_list_count(states.get());
}

void replaceAll(std::string& text, std::string_view from, std::string_view to) {
    for (std::size_t at = text.find(from); at != std::string::npos; at = text.find(from, at + to.size())) {
        text.replace(at, from.size(), to);
    }
}

}  // namespace

const ThemeParts::Group& ThemeParts::groupOf(const Evas_Object* themed) {
    const char* file = nullptr;
    const char* group = nullptr;
    edje_object_file_get(themed, &file, &group);
    const bool isThemed = file && group;
    const auto [known, isNew] = groups_.try_emplace(isThemed ? std::string(file) + '\n' + group : "");
    if (isThemed && isNew) {
        read(file, group, known->second);
    }
    return known->second;
}

void ThemeParts::nameParts(const Evas_Object* themed, Element& element) {
    const Group& group = groupOf(themed);
    for (const std::string& part : group.texts) {
        const Evas_Object* object = edje_object_part_object_get(themed, part.c_str());
        for (Text& text : element.texts) {
            if (text.object == object) {
                text.part = part;
            }
        }
    }
    for (const std::string& part : group.swallows) {
        const Evas_Object* object = edje_object_part_swallow_get(themed, part.c_str());
        for (Element& child : element.children) {
            if (object && child.object == object) {
                child.part = part;
            }
        }
    }
}

void ThemeParts::read(const std::string& file, const std::string& name, Group& group) const {
    const Object reader(edje_edit_object_add(canvas_));
    if (!reader || !edje_object_file_set(reader.get(), file.c_str(), name.c_str())) {
        return;
    }
    const bool ofToolkit = name.starts_with("elm/");
    const Names parts(edje_edit_parts_list_get(reader.get()));
    for (const Eina_List* node = parts.get(); node; node = eina_list_next(node)) {
        const auto* part = static_cast<const char*>(eina_list_data_get(node));
        const Edje_Part_Type type = edje_edit_part_type_get(reader.get(), part);
        if (type == EDJE_PART_TYPE_TEXT || type == EDJE_PART_TYPE_TEXTBLOCK) {
            group.texts.emplace_back(part);
            continue;
        }
        const bool holdsContent = type == EDJE_PART_TYPE_SWALLOW;
        if (holdsContent) {
            group.swallows.emplace_back(part);
        }
        if (!ofToolkit && countStates(reader.get(), part) > 1) {
            group.changing.push_back({part, holdsContent});
        }
    }
}

const std::vector<std::string>& ThemeParts::itemTexts(const std::string& group) {
    const auto [known, isNew] = itemTexts_.try_emplace(group);
    if (!isNew) {
        return known->second;
    }
    const char* file = elm_theme_group_path_find(nullptr, group.c_str());
    const Object reader(file ? edje_object_add(canvas_) : nullptr);
    if (reader && edje_object_file_set(reader.get(), file, group.c_str())) {
        const char* names = edje_object_data_get(reader.get(), "texts");
        std::istringstream words(names ? names : "");
        for (std::string word; words >> word;) {
            known->second.push_back(word);
        }
    }
    return known->second;
}

std::string plainText(const std::string& markup) {
    const std::unique_ptr<char, Free> plain(evas_textblock_text_markup_to_utf8(nullptr, markup.c_str()));
    std::string text = plain ? plain.get() : "";
    replaceAll(text, "\xEF\xBF\xBC", "");   // where a picture stands
    replaceAll(text, "\xE2\x80\xA9", " ");  // paragraph separator
    replaceAll(text, "\n", " ");
    return text;
}

}  // namespace remote_control
