#pragma once

#include "BounceGuard.h"

#include <deque>
#include <optional>

namespace app_assist {

/// The finger on a scroller of pages: a flick or a long way turns the page, by one. EFL asks for nearly twice a flick's
/// speed, and measures a way by a position that lags behind the finger. A page that is asked for under the finger comes
/// when it lifts: EFL drags on from where the touch began, and forgets that page. And a page does not stay halfway:
/// EFL leaves it there at times when what lies upon it took the finger that stopped it.
/// Belongs to the scroller, and goes with it.
class PageFinger {
public:
    /// For as long as the scroller lives, whose it is. `guard` is that of the same scroller.
    static PageFinger& attach(Evas_Object* scroller, BounceGuard& guard);

    /// `page` was brought into view, and is to stay there whatever a finger does that is on the scroller.
    void keep(int page) { kept_ = page; }

private:
    struct Place {
        double time;  ///< seconds
        int x;
    };

    PageFinger(Evas_Object* scroller, BounceGuard& guard) : scroller_(scroller), guard_(guard) {}
    void touched(Place place);
    void moved(Place place);
    void dragged();
    void lifted(Place place);
    void turn();
    std::optional<int> pageToTurnTo() const;
    std::optional<int> neighbour() const;
    int pageInView() const;
    int pagesToTurn() const;
    bool isHalfway() const;

    Evas_Object* scroller_;
    BounceGuard& guard_;
    /// Of the touch that is on or was the last: where it began, and where it was of late.
    int began_ = 0;
    std::deque<Place> lately_;
    std::optional<int> page_;  ///< in view when that touch began to drag, if it did
    std::optional<int> kept_;  ///< asked for since the touch began
    Ecore_Job* job_ = nullptr;
};

}  // namespace app_assist
