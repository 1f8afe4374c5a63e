#include "SampleWindow.h"

#include <cstring>

namespace sample {

namespace {

constexpr long rowCount = 40;

std::string fruit(long index) {
    return index == 0 ? "Apple" : "Fruit " + std::to_string(index);
}

/// More than a row, and all rows together than a bus, can take.
std::string praise() {
    std::string praise;
    for (int i = 0; i < 1000; ++i) {
        praise += " is very good";
    }
    return praise;
}

char* textOf(void* data, Evas_Object*, const char* part) {
    return std::strcmp(part, "elm.text") == 0 ? strdup(fruit(reinterpret_cast<long>(data)).c_str()) : nullptr;
}

char* longTextOf(void* data, Evas_Object*, const char* part) {
    const std::string text = fruit(reinterpret_cast<long>(data)) + praise();
    return std::strcmp(part, "elm.text") == 0 ? strdup(text.c_str()) : nullptr;
}

void fillWindow(Evas_Object* window, Evas_Object* object) {
    evas_object_size_hint_weight_set(object, EVAS_HINT_EXPAND, EVAS_HINT_EXPAND);
    elm_win_resize_object_add(window, object);
    evas_object_show(object);
}

}  // namespace

SampleWindow::SampleWindow(Evas_Object* window, const std::string& title, bool talkative)
    : talkative_(talkative), stack_(elm_naviframe_add(window)), list_(elm_genlist_add(stack_)) {
    Evas_Object* background = elm_bg_add(window);
    fillWindow(window, background);
    fillWindow(window, stack_);
    evas_object_name_set(list_, "FruitView");
    fillList();
    page_ = elm_naviframe_item_push(stack_, title.c_str(), nullptr, nullptr, list_, nullptr);
}

void SampleWindow::setTitle(const std::string& title) const {
    elm_object_item_part_text_set(page_, "elm.text.title", title.c_str());
}

void SampleWindow::fillList() {
    Elm_Genlist_Item_Class* row = elm_genlist_item_class_new();
    row->item_style = "default";
    row->func.text_get = talkative_ ? longTextOf : textOf;
    for (long i = 0; i < rowCount; ++i) {
        elm_genlist_item_append(list_, row, reinterpret_cast<void*>(i), nullptr, ELM_GENLIST_ITEM_NONE, onChosen, this);
    }
    elm_genlist_item_class_free(row);
}

void SampleWindow::onChosen(void* data, Evas_Object*, void* item) {
    auto* self = static_cast<SampleWindow*>(data);
    elm_genlist_item_selected_set(static_cast<Elm_Object_Item*>(item), EINA_FALSE);
    ++self->choices_;
    Evas_Object* text = elm_entry_add(self->stack_);
    elm_entry_editable_set(text, EINA_FALSE);
    elm_object_text_set(text, "A page with a &lt;text&gt;<br/>and a second line");
    evas_object_name_set(text, "PageView");
    elm_naviframe_item_push(self->stack_, "Page", nullptr, nullptr, text, nullptr);
}

}  // namespace sample
