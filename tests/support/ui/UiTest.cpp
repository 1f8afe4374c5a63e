#include "ui/UiTest.h"

namespace test_ui {

Evas_Object* UiTest::window(int width, int height) {
    if (window_)
        return window_;
    window_ = elm_win_add(nullptr, "test", ELM_WIN_BASIC);
    evas_object_resize(window_, width, height);
    Evas_Object* background = elm_bg_add(window_);
    evas_object_size_hint_weight_set(background, EVAS_HINT_EXPAND, EVAS_HINT_EXPAND);
    elm_win_resize_object_add(window_, background);
    evas_object_show(background);
    evas_object_show(window_);
    clock::driveAnimations();
    return window_;
}

Screen& UiTest::screen() {
    if (!screen_)
        screen_ = std::make_unique<Screen>(window());
    return *screen_;
}

}  // namespace test_ui
