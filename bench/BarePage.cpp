#include "BarePage.h"

namespace bench {
namespace {

constexpr int areaWidth = 716;
constexpr int iconSize = 62;

void fill(Evas_Object* object) {
    evas_object_size_hint_align_set(object, EVAS_HINT_FILL, EVAS_HINT_FILL);
    evas_object_size_hint_weight_set(object, EVAS_HINT_EXPAND, EVAS_HINT_EXPAND);
}

Evas_Object* makeImage(Evas_Object* parent, const std::string& file) {
    Evas_Object* image = elm_image_add(parent);
    elm_image_file_set(image, file.c_str(), nullptr);
    return image;
}

Evas_Object* makePicture(Evas_Object* parent, const Picture& picture, int height) {
    Evas_Object* sized = makeSized(parent, makeImage(parent, picture.file), areaWidth, height);
    if (!picture.marker.empty()) {
        Evas_Object* marker = makeImage(sized, picture.marker);
        fill(marker);
        // Seen only when its demonstration comes to it.
        elm_table_pack(sized, marker, 0, 0, 1, 1);
    }
    return sized;
}

Evas_Object* makeScroller(Evas_Object* parent) {
    Evas_Object* scroller = elm_scroller_add(parent);
    elm_scroller_policy_set(scroller, ELM_SCROLLER_POLICY_OFF, ELM_SCROLLER_POLICY_OFF);
    elm_scroller_bounce_set(scroller, EINA_FALSE, EINA_FALSE);
    return scroller;
}

Evas_Object* makePictures(Evas_Object* parent, const Page& page) {
    if (page.pictures.size() == 1 && !page.isTall()) {
        return makePicture(parent, page.pictures.front(), Page::areaHeight);
    }
    Evas_Object* scroller = makeScroller(parent);
    if (page.isTall()) {
        elm_scroller_movement_block_set(scroller, ELM_SCROLLER_MOVEMENT_BLOCK_VERTICAL);
        elm_object_content_set(scroller, makePicture(scroller, page.pictures.front(), page.height));
    } else {
        elm_scroller_movement_block_set(scroller, ELM_SCROLLER_MOVEMENT_BLOCK_HORIZONTAL);
        Evas_Object* row = elm_box_add(scroller);
        elm_box_horizontal_set(row, EINA_TRUE);
        for (const Picture& picture : page.pictures) {
            elm_box_pack_end(row, makePicture(row, picture, Page::areaHeight));
        }
        elm_object_content_set(scroller, row);
    }
    return makeSized(parent, scroller, areaWidth, Page::areaHeight);
}

Evas_Object* makeTitle(Evas_Object* parent, const Page& page) {
    Evas_Object* row = elm_box_add(parent);
    elm_box_horizontal_set(row, EINA_TRUE);
    elm_box_pack_end(row, makeSized(row, makeImage(row, page.icon), iconSize, iconSize));
    Evas_Object* label = elm_label_add(row);
    elm_label_line_wrap_set(label, ELM_WRAP_MIXED);
    evas_object_size_hint_weight_set(label, EVAS_HINT_EXPAND, 0);
    evas_object_size_hint_align_set(label, EVAS_HINT_FILL, EVAS_HINT_FILL);
    elm_object_text_set(label, ("<align=center><font_size=46>" + page.title + "</font_size></align>").c_str());
    evas_object_show(label);
    elm_box_pack_end(row, label);
    evas_object_size_hint_align_set(row, EVAS_HINT_FILL, 0);
    evas_object_size_hint_weight_set(row, EVAS_HINT_EXPAND, 0);
    evas_object_show(row);
    return row;
}

Evas_Object* makeText(Evas_Object* parent, const Page& page) {
    Evas_Object* scroller = makeScroller(parent);
    fill(scroller);
    Evas_Object* entry = elm_entry_add(scroller);
    elm_entry_editable_set(entry, EINA_FALSE);
    elm_entry_entry_set(entry, page.text.c_str());
    fill(entry);
    elm_object_content_set(scroller, entry);
    evas_object_show(entry);
    evas_object_show(scroller);
    return scroller;
}

}  // namespace

Evas_Object* makeSized(Evas_Object* parent, Evas_Object* content, int width, int height) {
    Evas_Object* table = elm_table_add(parent);
    Evas_Object* size = evas_object_rectangle_add(evas_object_evas_get(parent));
    evas_object_size_hint_min_set(size, width, height);
    // A table grows where all that it has does.
    fill(size);
    elm_table_pack(table, size, 0, 0, 1, 1);
    fill(content);
    elm_table_pack(table, content, 0, 0, 1, 1);
    evas_object_show(content);
    evas_object_show(table);
    return table;
}

Evas_Object* makeBarePage(Evas_Object* parent, const Page& page) {
    Evas_Object* column = elm_box_add(parent);
    fill(column);
    elm_box_pack_end(column, makePictures(column, page));
    elm_box_pack_end(column, makeTitle(column, page));
    elm_box_pack_end(column, makeText(column, page));
    evas_object_show(column);
    return column;
}

}  // namespace bench
