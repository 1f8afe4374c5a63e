#pragma once

#include <Elementary.h>

#include <functional>

namespace app_assist {

/// Pairs a scroller's "scroll,anim,start" and "scroll,anim,stop": each movement ends once. EFL goes on to animate a
/// scroller that stands still after a sideways bounce at its first or last page, and says "scroll,anim,stop" at every
/// frame, for ever. The guard ends that animation, and nobody who listens after it hears the surplus stops, nor
/// anything of a scroller that goes.
class BounceGuard {
public:
    /// For as long as the scroller lives, whose it is. To be called before others listen to the scroller.
    static BounceGuard& attach(Evas_Object* scroller);

    /// Between a start and its stop.
    bool isMoving() const { return moving_; }
    /// Runs what gives a movement another end; a movement that is under way stays the same one.
    void redirect(const std::function<void()>& change);

private:
    explicit BounceGuard(Evas_Object* scroller) : scroller_(scroller) {}
    void started();
    void stopped();
    void stayHere();
    void hush() const;

    Evas_Object* scroller_;
    Ecore_Job* job_ = nullptr;
    bool moving_ = false;
    bool redirects_ = false;
    bool going_ = false;
};

}  // namespace app_assist
