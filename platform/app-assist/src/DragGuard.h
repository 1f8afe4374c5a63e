#pragma once

#include <Elementary.h>

namespace app_assist {

/// Keeps texts out of a drag of what they lie in. A text moves its cursor when the finger lifts and has the cursor
/// brought into view, which snaps a page back that was about to turn and takes a scroller's momentum away.
/// So while a scroller is dragged, the texts inside it get no events. Links still work: a tap is no drag.
class DragGuard {
public:
    /// Guards this scroller, and all scrollers inside it, for as long as they live.
    static void attach(Evas_Object* scroller);

private:
    explicit DragGuard(Evas_Object* scroller) : scroller_(scroller) {}
    void dragBegins();
    void dragEnds();
    void release();

    Evas_Object* scroller_;
    Ecore_Job* job_ = nullptr;
};

}  // namespace app_assist
