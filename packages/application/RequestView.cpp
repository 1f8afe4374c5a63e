#include "RequestView.h"

#include "PlainLine.h"

#include <app_common.h>

#include <cstdlib>
#include <memory>

namespace {

struct Free {
    void operator()(char* text) const { std::free(text); }
};

std::string themeFile() {
    const std::unique_ptr<char, Free> resources(app_get_resource_path());
    return std::string(resources ? resources.get() : "") + "edje/application.edj";
}

void fill(Evas_Object* object) {
    evas_object_size_hint_weight_set(object, EVAS_HINT_EXPAND, EVAS_HINT_EXPAND);
    evas_object_size_hint_align_set(object, EVAS_HINT_FILL, EVAS_HINT_FILL);
}

}  // namespace

Evas_Object* RequestView::onCreate(Evas_Object* parent, void*) {
    Evas_Object* page = elm_layout_add(parent);
    elm_layout_file_set(page, themeFile().c_str(), "application/page");
    fill(page);
    addIcon(page);
    addLines(page);
    return page;
}

void RequestView::addIcon(Evas_Object* page) const {
    Evas_Object* shape = elm_layout_add(page);
    elm_layout_theme_set(shape, "layout", "list/B/type.2", "default");
    Evas_Object* image = elm_image_add(shape);
    elm_image_file_set(image, icon_.c_str(), nullptr);
    elm_object_part_content_set(shape, "elm.swallow.content", image);
    elm_object_part_content_set(page, "icon", shape);
}

void RequestView::addLines(Evas_Object* page) {
    Evas_Object* scroller = elm_scroller_add(page);
    elm_object_style_set(scroller, "effect");
    elm_scroller_policy_set(scroller, ELM_SCROLLER_POLICY_OFF, ELM_SCROLLER_POLICY_AUTO);
    lines_ = elm_box_add(scroller);
    elm_box_align_set(lines_, 0.5, 0.0);
    evas_object_size_hint_weight_set(lines_, EVAS_HINT_EXPAND, 0.0);
    evas_object_size_hint_align_set(lines_, EVAS_HINT_FILL, 0.0);
    elm_object_content_set(scroller, lines_);
    elm_object_part_content_set(page, "lines", scroller);
}

void RequestView::show(const std::vector<std::string>& lines) {
    elm_box_clear(lines_);
    for (const std::string& text : lines) {
        Evas_Object* line = elm_layout_add(lines_);
        elm_layout_file_set(line, themeFile().c_str(), "application/line");
        evas_object_size_hint_weight_set(line, EVAS_HINT_EXPAND, 0.0);
        evas_object_size_hint_align_set(line, EVAS_HINT_FILL, 0.0);
        // Past the layout, which takes texts as markup.
        edje_object_part_text_unescaped_set(elm_layout_edje_get(line), "text", plainLine(text).c_str());
        evas_object_show(line);
        elm_box_pack_end(lines_, line);
    }
}
