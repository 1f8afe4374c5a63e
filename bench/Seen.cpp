#include "Seen.h"

#include "FrameWatch.h"
#include "LoopWatch.h"

#include <algorithm>
#include <string_view>

#include <dlfcn.h>

namespace bench {
namespace {

/// The function of that name that the program would have called.
template <class Function>
Function* next(const char* name) {
    return reinterpret_cast<Function*>(dlsym(RTLD_NEXT, name));
}

}  // namespace

Seen& Seen::get() {
    static Seen seen;
    return seen;
}

void Seen::addImage(Evas_Object* image, const char* file) {
    images_.push_back({image, file ? file : ""});
    evas_object_event_callback_add(
        image, EVAS_CALLBACK_DEL,
        [](void*, Evas*, Evas_Object* deleted, void*) {
            std::erase_if(get().images_, [deleted](const Image& each) { return each.object == deleted; });
        },
        nullptr);
}

bool Seen::isInSight(const std::string& file) const {
    return std::any_of(images_.begin(), images_.end(), [&file](const Image& image) {
        if (image.file != file) {
            return false;
        }
        int x = 0, y = 0, width = 0, height = 0, displayWidth = 0, displayHeight = 0;
        evas_object_geometry_get(image.object, &x, &y, &width, &height);
        evas_output_size_get(FrameWatch::get().canvas(), &displayWidth, &displayHeight);
        const bool inDisplay = width > 0 && x < displayWidth && x + width > 0 && y < displayHeight && y + height > 0;
        return inDisplay && evas_object_visible_get(image.object) &&
               evas_object_visible_get(elm_image_object_get(image.object));
    });
}

Evas_Object* Seen::scrollerAround(const std::string& file) const {
    const auto found =
        std::find_if(images_.begin(), images_.end(), [&file](const Image& image) { return image.file == file; });
    Evas_Object* widget = found == images_.end() ? nullptr : found->object;
    while (widget && std::string_view("Elm_Scroller") != elm_object_widget_type_get(widget)) {
        widget = elm_object_parent_widget_get(widget);
    }
    return widget;
}

}  // namespace bench

extern "C" {

Evas* evas_new() {
    Evas* canvas = bench::next<decltype(evas_new)>("evas_new")();
    bench::FrameWatch::get().watch(canvas);
    return canvas;
}

Evas_Object* elm_genlist_add(Evas_Object* parent) {
    Evas_Object* list = bench::next<decltype(elm_genlist_add)>("elm_genlist_add")(parent);
    bench::Seen::get().list = list;
    return list;
}

Evas_Object* elm_scroller_add(Evas_Object* parent) {
    Evas_Object* scroller = bench::next<decltype(elm_scroller_add)>("elm_scroller_add")(parent);
    if (!bench::Seen::get().pager) {
        bench::Seen::get().pager = scroller;
    }
    return scroller;
}

/// Each page has one: it tells in which turn of the loop the page was filled.
Evas_Object* elm_entry_add(Evas_Object* parent) {
    bench::LoopWatch::get().note();
    return bench::next<decltype(elm_entry_add)>("elm_entry_add")(parent);
}

Eina_Bool elm_image_file_set(Evas_Object* image, const char* file, const char* group) {
    bench::Seen::get().addImage(image, file);
    return bench::next<decltype(elm_image_file_set)>("elm_image_file_set")(image, file, group);
}

/// Frames count from here on: the transition to the page that is pushed starts.
Elm_Object_Item* elm_naviframe_item_push(Evas_Object* naviframe, const char* title, Evas_Object* back,
                                         Evas_Object* nextButton, Evas_Object* content, const char* style) {
    bench::FrameWatch::get().forget();
    return bench::next<decltype(elm_naviframe_item_push)>("elm_naviframe_item_push")(naviframe, title, back, nextButton,
                                                                                     content, style);
}
}
