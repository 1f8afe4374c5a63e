// The only interface that tells which signals a compiled group knows.
#define EDJE_EDIT_IS_UNSTABLE_AND_I_KNOW_ABOUT_IT

#include "Group.h"

#include <Edje.h>
#include <Edje_Edit.h>

#include <memory>
#include <regex>
#include <stdexcept>
#include <vector>

namespace theme_test {
namespace {

struct DeleteObject {
    void operator()(Evas_Object* object) const { evas_object_del(object); }
};
using Object = std::unique_ptr<Evas_Object, DeleteObject>;

std::vector<std::string> strings(Eina_List* list) {
    std::vector<std::string> all;
    for (const Eina_List* node = list; node; node = eina_list_next(node))
        all.emplace_back(static_cast<const char*>(eina_list_data_get(node)));
    edje_edit_string_list_free(list);
    return all;
}

std::string string(const char* text) {
    const std::string copy = text ? text : "";
    edje_edit_string_free(text);
    return copy;
}

void insertName(std::set<std::string>& names, const std::string& name) {
    if (!name.empty())
        names.insert(name);
}

/// Text blocks are coloured by their styles, which belong to the file: "color=cc:<class>".
void readStyles(Evas_Object* edit, Group& group) {
    const std::regex colour("color=cc:([^ ']+)");
    for (const std::string& style : strings(edje_edit_styles_list_get(edit))) {
        for (const std::string& tag : strings(edje_edit_style_tags_list_get(edit, style.c_str()))) {
            const std::string value = string(edje_edit_style_tag_value_get(edit, style.c_str(), tag.c_str()));
            for (std::sregex_iterator match(value.begin(), value.end(), colour), end; match != end; ++match)
                group.colourClasses.insert((*match)[1]);
        }
    }
}

void readPart(Evas_Object* edit, const std::string& part, Group& group) {
    group.parts.insert(part);
    if (edje_edit_part_type_get(edit, part.c_str()) == EDJE_PART_TYPE_TEXTBLOCK)
        readStyles(edit, group);
    const bool isText = edje_edit_part_type_get(edit, part.c_str()) == EDJE_PART_TYPE_TEXT;
    for (const std::string& state : strings(edje_edit_part_states_list_get(edit, part.c_str()))) {
        const std::string name = state.substr(0, state.find(' '));
        insertName(group.colourClasses, string(edje_edit_state_color_class_get(edit, part.c_str(), name.c_str(), 0.0)));
        if (isText)
            insertName(group.textClasses,
                       string(edje_edit_state_text_class_get(edit, part.c_str(), name.c_str(), 0.0)));
    }
}

void readProgram(Evas_Object* edit, const std::string& program, Group& group) {
    const std::string signal = string(edje_edit_program_signal_get(edit, program.c_str()));
    if (!signal.empty())
        group.signalsIn.insert(string(edje_edit_program_source_get(edit, program.c_str())) + ": " + signal);
    if (edje_edit_program_action_get(edit, program.c_str()) == EDJE_ACTION_TYPE_SIGNAL_EMIT)
        group.signalsOut.insert(string(edje_edit_program_state2_get(edit, program.c_str())) + ": " +
                                string(edje_edit_program_state_get(edit, program.c_str())));
}

}  // namespace

bool hasGroup(const std::string& file, const std::string& group) {
    return edje_file_group_exists(file.c_str(), group.c_str());
}

std::string dataItem(Evas* canvas, const std::string& file, const std::string& group, const std::string& name) {
    const Object object(edje_object_add(canvas));
    edje_object_file_set(object.get(), file.c_str(), group.c_str());
    const char* value = edje_object_data_get(object.get(), name.c_str());
    return value ? value : "";
}

Group readGroup(Evas* canvas, const std::string& file, const std::string& name) {
    const Object edit(edje_edit_object_add(canvas));
    if (!edje_object_file_set(edit.get(), file.c_str(), name.c_str()))
        throw std::runtime_error("no group " + name + " in " + file);
    Group group;
    for (const std::string& part : strings(edje_edit_parts_list_get(edit.get())))
        readPart(edit.get(), part, group);
    for (const std::string& program : strings(edje_edit_programs_list_get(edit.get())))
        readProgram(edit.get(), program, group);
    return group;
}

}  // namespace theme_test
