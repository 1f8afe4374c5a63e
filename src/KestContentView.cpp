#include "KestContentView.h"

#include "KestCommon.h"
#include "KestLog.h"

#include <app-assist/WNaviframe.h>

KestContentView::KestContentView(int listIndex, bool onTop) : __selectedView(listIndex - 2), pushOnTop(onTop) {
    KEST_BEGIN();
    KEST_INFO("__selectedView:%d", __selectedView);
}

Evas_Object* KestContentView::onCreate(Evas_Object* parent, void*) {
    KEST_BEGIN();
    Evas_Object* layout = elm_layout_add(parent);
    elm_layout_theme_set(layout, "layout", "application", "default");
    evas_object_size_hint_weight_set(layout, EVAS_HINT_EXPAND, EVAS_HINT_EXPAND);
    evas_object_show(layout);
    return layout;
}

Elm_Object_Item* KestContentView::onPushToNaviframe(Evas_Object* naviframe) {
    WASSERT(getEvasObj() != nullptr);
    elm_object_item_part_content_unset(getNaviItem(), "title_left_btn");
    Evas_Object* back = KestCommon::createButton(naviframe, "naviframe/back_btn/default", nullptr, __backCb, this);
    if (pushOnTop) {
        return elm_naviframe_item_push(naviframe, nullptr, back, nullptr, getEvasObj(), nullptr);
    }
    return elm_naviframe_item_insert_after(naviframe, elm_naviframe_top_item_get(naviframe), nullptr, back, nullptr,
                                           getEvasObj(), nullptr);
}

void KestContentView::onPushed(Elm_Object_Item*) {
    KEST_BEGIN();
}

void KestContentView::__backCb(void* data, Evas_Object*, void*) {
    if (!data) {
        KEST_ERR("Invalid Param : data");
        return;
    }
    const auto* view = static_cast<KestContentView*>(data);
    elm_naviframe_item_pop(view->getNaviframe()->getEvasObj());
}
