#include "ui/Screen.h"

#include "ui/Clock.h"

#include <Ecore_Evas.h>

namespace test_ui {

Rect geometry(const Evas_Object* object) {
    Rect rect;
    evas_object_geometry_get(object, &rect.x, &rect.y, &rect.width, &rect.height);
    return rect;
}

void Screen::press(Point at) {
    inMainLoop([&] {
        evas_event_feed_mouse_in(canvas(), clock::timestamp(), nullptr);
        evas_event_feed_mouse_move(canvas(), at.x, at.y, clock::timestamp(), nullptr);
        evas_event_feed_mouse_down(canvas(), 1, EVAS_BUTTON_NONE, clock::timestamp(), nullptr);
    });
}

void Screen::moveTo(Point to) {
    inMainLoop([&] { evas_event_feed_mouse_move(canvas(), to.x, to.y, clock::timestamp(), nullptr); });
}

void Screen::lift() {
    inMainLoop([&] { evas_event_feed_mouse_up(canvas(), 1, EVAS_BUTTON_NONE, clock::timestamp(), nullptr); });
}

void Screen::tap(Point at, double hold) {
    press(at);
    runFor(hold);
    lift();
    // What a tap sets off by way of edje's signals comes with the next turn of the loop.
    runFor(0.01);
}

void Screen::swipe(Point from, Point to, double seconds) {
    constexpr int steps = 10;
    press(from);
    for (int step = 1; step <= steps; ++step) {
        runFor(seconds / steps);
        moveTo({from.x + (to.x - from.x) * step / steps, from.y + (to.y - from.y) * step / steps});
    }
    lift();
}

void Screen::key(const std::string& name) {
    if (!focused_)
        takeFocus();
    inMainLoop([&] {
        const char* key = name.c_str();
        evas_event_feed_key_down(canvas(), key, key, nullptr, nullptr, clock::timestamp(), nullptr);
    });
    // The window may be gone by now.
    if (!hasEnded())
        inMainLoop([&] {
            const char* key = name.c_str();
            evas_event_feed_key_up(canvas(), key, key, nullptr, nullptr, clock::timestamp(), nullptr);
        });
    runFor(0.01);
}

/// A window in memory says that it has the focus, but its focus manager was never told.
void Screen::takeFocus() {
    Ecore_Evas* frame = ecore_evas_ecore_evas_get(canvas());
    ecore_evas_focus_set(frame, EINA_FALSE);
    runFor(0.1);
    ecore_evas_focus_set(frame, EINA_TRUE);
    runFor(0.2);
    focused_ = true;
}

Picture Screen::picture() {
    Ecore_Evas* frame = ecore_evas_ecore_evas_get(canvas());
    // Waits for a frame that a thread still draws, then draws here, also what earlier frames left undrawn.
    evas_sync(canvas());
    int width = 0, height = 0;
    ecore_evas_geometry_get(frame, nullptr, nullptr, &width, &height);
    evas_damage_rectangle_add(canvas(), 0, 0, width, height);
    evas_render(canvas());
    return Picture(width, height, static_cast<const unsigned int*>(ecore_evas_buffer_pixels_get(frame)));
}

}  // namespace test_ui
