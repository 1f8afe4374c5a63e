#include "Objects.h"

#include <Elementary.h>

#include <algorithm>
#include <array>
#include <memory>
#include <string_view>

namespace remote_control {

namespace {

struct ListFree {
    void operator()(Eina_List* list) const { eina_list_free(list); }
};

/// The objects that draw have no members, and EFL complains when it is asked for them.
bool canHaveMembers(const Evas_Object* object) {
    static constexpr std::array drawing{"rectangle", "line", "polygon", "text", "textblock", "textgrid", "image", "vg"};
    const char* type = evas_object_type_get(object);
    return type && std::find(drawing.begin(), drawing.end(), std::string_view(type)) == drawing.end();
}

void visitBelow(Evas_Object* object, const std::function<void(Evas_Object* widget)>& visit) {
    if (isWidget(object)) {
        visit(object);
    }
    for (Evas_Object* member : membersOf(object)) {
        visitBelow(member, visit);
    }
}

}  // namespace

bool isWidget(const Evas_Object* object) {
    return object && elm_object_widget_check(object);
}

std::vector<Evas_Object*> membersOf(Evas_Object* object) {
    std::vector<Evas_Object*> members;
    if (!canHaveMembers(object)) {
        return members;
    }
    const std::unique_ptr<Eina_List, ListFree> list(evas_object_smart_members_get(object));
    for (const Eina_List* node = list.get(); node; node = eina_list_next(node)) {
        members.push_back(static_cast<Evas_Object*>(eina_list_data_get(node)));
    }
    return members;
}

std::vector<Evas_Object*> topObjects(Evas* canvas) {
    std::vector<Evas_Object*> objects;
    for (Evas_Object* object = evas_object_bottom_get(canvas); object; object = evas_object_above_get(object)) {
        if (!evas_object_smart_parent_get(object)) {
            objects.push_back(object);
        }
    }
    return objects;
}

void visitWidgets(Evas* canvas, const std::function<void(Evas_Object* widget)>& visit) {
    for (Evas_Object* object : topObjects(canvas)) {
        visitBelow(object, visit);
    }
}

}  // namespace remote_control
