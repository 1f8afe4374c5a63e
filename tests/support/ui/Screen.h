#pragma once

#include "ui/Picture.h"

#include <Elementary.h>

#include <string>

namespace test_ui {

struct Point {
    int x = 0;
    int y = 0;
};

struct Rect {
    int x = 0;
    int y = 0;
    int width = 0;
    int height = 0;

    Point middle() const { return {x + width / 2, y + height / 2}; }
    bool contains(const Rect& other) const {
        return other.x >= x && other.y >= y && other.x + other.width <= x + width &&
               other.y + other.height <= y + height;
    }
    bool operator==(const Rect&) const = default;
};

Rect geometry(const Evas_Object* object);

/// A window as its user has it: a finger on it, its keys, and what it shows. Owns nothing.
class Screen {
public:
    explicit Screen(Evas_Object* window) : window_(window) {}

    void press(Point at);
    void moveTo(Point to);
    void lift();
    void tap(Point at, double hold = 0.05);
    void tap(const Evas_Object* object, double hold = 0.05) { tap(geometry(object).middle(), hold); }
    /// A straight swipe. The default is a flick, which turns a page.
    void swipe(Point from, Point to, double seconds = 0.15);
    /// Presses and lifts a key by its name ("Escape", "XF86Back", "Down").
    void key(const std::string& name);

    /// Draws what is due and takes it down.
    Picture picture();

    Evas_Object* window() const { return window_; }
    Evas* canvas() const { return evas_object_evas_get(window_); }

private:
    void takeFocus();

    Evas_Object* window_;
    bool focused_ = false;
};

}  // namespace test_ui
