#include "FrameWatch.h"

#include "LoopWatch.h"

namespace bench {

FrameWatch& FrameWatch::get() {
    static FrameWatch watch;
    return watch;
}

void FrameWatch::watch(Evas* canvas) {
    if (canvas_) {
        return;
    }
    canvas_ = canvas;
    evas_event_callback_add(
        canvas, EVAS_CALLBACK_RENDER_PRE,
        [](void*, Evas*, void*) {
            FrameWatch& self = get();
            self.isIn_ = self.isSo_ && self.isSo_();
        },
        nullptr);
    evas_event_callback_add(
        canvas, EVAS_CALLBACK_RENDER_POST,
        [](void*, Evas*, void* info) {
            const auto* frame = static_cast<Evas_Event_Render_Post*>(info);
            if (frame && frame->updated_area) {
                get().frameEnds();
            }
        },
        nullptr);
}

void FrameWatch::forget() {
    frames_.clear();
    drawnFrame_ = 0;
    before_ = LoopWatch::get().work();
}

void FrameWatch::lookFor(std::function<bool()> isSo) {
    isSo_ = std::move(isSo);
    isIn_ = false;
}

void FrameWatch::frameEnds() {
    const Cost work = LoopWatch::get().work();
    frames_.push_back(work - before_);
    before_ = work;
    if (isIn_ && drawnFrame_ == 0) {
        drawnFrame_ = static_cast<int>(frames_.size());
        drawnTime_ = Cost::ofProcess();
    }
}

}  // namespace bench
