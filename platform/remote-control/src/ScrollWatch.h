#pragma once

#include <Evas.h>

#include <set>

namespace remote_control {

/// Knows whether something scrolls on a canvas: towards its end, or at the end of a list, a scrolling goes on without
/// anything new to draw, and a finger that comes down then only stops it.
/// Watches the widgets that are there when it is made.
class ScrollWatch {
public:
    explicit ScrollWatch(Evas* canvas);
    ~ScrollWatch();
    ScrollWatch(const ScrollWatch&) = delete;
    ScrollWatch& operator=(const ScrollWatch&) = delete;

    bool isScrolling() const;

private:
    static void onStart(void* data, Evas_Object* widget, void* info);
    static void onStop(void* data, Evas_Object* widget, void* info);
    static void onDelete(void* data, Evas* canvas, Evas_Object* widget, void* info);
    void watch(Evas_Object* widget);
    void forget(Evas_Object* widget);

    std::set<Evas_Object*> watched_;
    std::set<Evas_Object*> scrolling_;
    double momentumEnd_ = 0;
};

}  // namespace remote_control
