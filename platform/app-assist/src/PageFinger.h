#pragma once

#include "BounceGuard.h"

#include <deque>

namespace app_assist {

/// The finger on a scroller of pages: a flick or a long way turns the page, by one. EFL asks for nearly twice a flick's
/// speed, and measures a way by a position that lags behind the finger.
/// Belongs to the scroller, and goes with it.
class PageFinger {
public:
    /// For as long as the scroller lives. `guard` is that of the same scroller.
    static void attach(Evas_Object* scroller, BounceGuard& guard);

private:
    struct Place {
        double time;  ///< seconds
        int x;
    };

    PageFinger(Evas_Object* scroller, BounceGuard& guard) : scroller_(scroller), guard_(guard) {}
    void touched(Place place);
    void moved(Place place);
    void dragged();
    void letGo();
    void turn();
    int pagesToTurn() const;

    Evas_Object* scroller_;
    BounceGuard& guard_;
    /// Of the touch that is on or was the last: where it began, and where it was of late.
    int began_ = 0;
    std::deque<Place> lately_;
    int page_ = 0;  ///< in view when the dragging began
    Ecore_Job* job_ = nullptr;
};

}  // namespace app_assist
