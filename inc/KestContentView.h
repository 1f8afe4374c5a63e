#pragma once

#include <app-assist/WPageSlideView.h>

/// The screen that opens over the main list. So far an empty page with its back button.
class KestContentView : public app_assist::WPageSlideView {
public:
    /// `listIndex` is the genlist index of the chosen row: 2 for the first menu.
    /// `pushOnTop` false makes the view the top item without a transition.
    KestContentView(int listIndex, bool pushOnTop);

protected:
    Evas_Object* onCreate(Evas_Object* parent, void* viewParam) override;
    void onCreated() override {}
    void onDestroy() override {}
    Elm_Object_Item* onPushToNaviframe(Evas_Object* naviframe) override;
    void onPushed(Elm_Object_Item* naviItem) override;

private:
    static void __backCb(void* data, Evas_Object* obj, void* event_info);

    int __selectedView;
    bool pushOnTop;
};
