#pragma once

#include <Evas.h>

#include <list>

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
    struct Watched {
        Evas_Object* widget = nullptr;  ///< set to null by the toolkit when the widget has gone
        bool scrolling = false;
        double momentumEnd = 0;
    };

    static void onStart(void* data, Evas_Object* widget, void* info);
    static void onStop(void* data, Evas_Object* widget, void* info);

    std::list<Watched> widgets_;
};

}  // namespace remote_control
