#pragma once

#include "TipPage.h"

/// A test that listens to a pager as its pages move.
class PageMovement : public PageSlideViewTest {
protected:
    /// Opens a pager at `first` and listens to it, as an application does: when the pager has been created.
    Pager* listenTo(int first, int count = 5) {
        pager_ = open(first, count);
        movements_.listenTo(*pager_);
        test_ui::runFor(0.5);
        return pager_;
    }
    Story heard() { return movements_.heard(); }

    /// How many frames the main loop animated something in a second: none when the screen is at rest.
    int framesInASecond() {
        int frames = 0;
        Ecore_Timer* probe = ecore_timer_add(
            1.0 / 60,
            [](void* data) -> Eina_Bool {
                *static_cast<int*>(data) += test_ui::clock::isAnimating();
                return ECORE_CALLBACK_RENEW;
            },
            &frames);
        test_ui::runFor(1.0);
        ecore_timer_del(probe);
        return frames;
    }

    Pager* pager_ = nullptr;
    Movements movements_;
};
