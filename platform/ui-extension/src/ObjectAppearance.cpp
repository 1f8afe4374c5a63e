#include "ObjectAppearance.h"

#include "Log.h"

#include <Evas.h>

#include <algorithm>
#include <array>
#include <map>
#include <memory>
#include <string_view>
#include <utility>

namespace uxt {
namespace {

// On a layout: the object whose appearance it has.
constexpr char ownerKey[] = "uxt.appearance";

struct FreeList {
    void operator()(Eina_List* list) const { eina_list_free(list); }
};

std::map<const void*, const ObjectAppearance*>& appearances() {
    static std::map<const void*, const ObjectAppearance*> all;
    return all;
}

bool canHaveMembers(std::string_view type) {
    static constexpr std::array drawings{"rectangle", "line",     "polygon", "text",
                                         "textblock", "textgrid", "image",   "vg"};
    return std::find(drawings.begin(), drawings.end(), type) == drawings.end();
}

}  // namespace

ObjectAppearance::ObjectAppearance(Evas_Object* object) : object_(object) {
    appearances()[object] = this;
}

ObjectAppearance::~ObjectAppearance() {
    set({});
    appearances().erase(object_);
}

void ObjectAppearance::set(ClassSet classes) {
    const ClassSet before = std::exchange(classes_, std::move(classes));
    forEachLayout(object_, [&](Evas_Object* layout) {
        if (evas_object_data_get(layout, ownerKey) == object_)
            applyToLayout(layout, before, classes_);
        else
            adopt(layout);
        if (classes_.isEmpty())
            evas_object_data_del(layout, ownerKey);
    });
    watchForNewLayouts(!classes_.isEmpty());
}

void ObjectAppearance::watchForNewLayouts(bool watch) {
    if (watches_ == watch)
        return;
    watches_ = watch;
    Evas* canvas = evas_object_evas_get(object_);
    if (watch)
        evas_event_callback_add(canvas, EVAS_CALLBACK_RENDER_PRE, beforeFrame, this);
    else
        evas_event_callback_del_full(canvas, EVAS_CALLBACK_RENDER_PRE, beforeFrame, this);
}

void ObjectAppearance::beforeFrame(void* self, Evas* canvas, void*) {
    guarded("an object's colours", [&] {
        // Rows and pages that the frame will show are made while sizes are worked out.
        evas_smart_objects_calculate(canvas);
        if (static_cast<ObjectAppearance*>(self)->adoptNewLayouts())
            evas_smart_objects_calculate(canvas);
    });
}

bool ObjectAppearance::adoptNewLayouts() {
    bool isAnyNew = false;
    forEachLayout(object_, [&](Evas_Object* layout) {
        if (evas_object_data_get(layout, ownerKey) == object_)
            return;
        adopt(layout);
        isAnyNew = true;
    });
    return isAnyNew;
}

void ObjectAppearance::adopt(Evas_Object* layout) {
    const auto previous = appearances().find(evas_object_data_get(layout, ownerKey));
    applyToLayout(layout, previous == appearances().end() ? ClassSet{} : previous->second->classes_, classes_);
    evas_object_data_set(layout, ownerKey, object_);
}

void ObjectAppearance::forEachLayout(Evas_Object* object, const std::function<void(Evas_Object*)>& visit) const {
    const char* type = evas_object_type_get(object);
    if (!type || !canHaveMembers(type) || (object != object_ && appearances().contains(object)))
        return;
    if (std::string_view(type) == "edje")
        visit(object);
    const std::unique_ptr<Eina_List, FreeList> members(evas_object_smart_members_get(object));
    for (const Eina_List* node = members.get(); node; node = eina_list_next(node))
        forEachLayout(static_cast<Evas_Object*>(eina_list_data_get(node)), visit);
}

}  // namespace uxt
