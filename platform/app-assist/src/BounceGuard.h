#pragma once

#include <Elementary.h>

namespace app_assist {

/// Ends what EFL leaves going: after a sideways bounce at the first or last page it goes on to animate a scroller
/// that stands still, and says "scroll,anim,stop" at every frame, for ever. With the guard it says so twice at once:
/// when the bounce ends, and when its animation is taken away.
class BounceGuard {
public:
    /// For as long as the scroller lives.
    static void attach(Evas_Object* scroller);

private:
    explicit BounceGuard(Evas_Object* scroller) : scroller_(scroller) {}
    void stopped();
    void stayHere();

    Evas_Object* scroller_;
    Ecore_Job* job_ = nullptr;
    bool moving_ = false;
    bool held_ = false;
};

}  // namespace app_assist
