#include "Settling.h"

#include "Guarded.h"
#include "ScrollWatch.h"

namespace remote_control {

namespace {

constexpr double quietSeconds = 0.15;
constexpr double mostSeconds = 3;
/// Animations are ticked from a thread of the toolkit's. On a busy machine that gets no time for longer than a screen
/// is quiet, and a transition stands still; so a screen is quiet only when ticks went by without a frame. Fewer than
/// fit into that time, since late ones are dropped.
constexpr int quietTicks = 5;

}  // namespace

Settling::Settling(Evas* canvas, const ScrollWatch& scrolls, std::function<void()> done)
    : canvas_(canvas), scrolls_(scrolls), done_(std::move(done)) {
    evas_event_callback_add(canvas_, EVAS_CALLBACK_RENDER_PRE, onFrameBegin, this);
    evas_event_callback_add(canvas_, EVAS_CALLBACK_RENDER_POST, onFrameEnd, this);
    evas_event_callback_add(canvas_, EVAS_CALLBACK_FREE, onCanvasFree, this);
    deadline_ = ecore_timer_add(mostSeconds, onDeadline, this);
    ticker_ = ecore_animator_add(onTick, this);
    waitForQuiet();
}

Settling::~Settling() {
    leave();
}

void Settling::leave() {
    if (canvas_) {
        evas_event_callback_del_full(canvas_, EVAS_CALLBACK_RENDER_PRE, onFrameBegin, this);
        evas_event_callback_del_full(canvas_, EVAS_CALLBACK_RENDER_POST, onFrameEnd, this);
        evas_event_callback_del_full(canvas_, EVAS_CALLBACK_FREE, onCanvasFree, this);
        canvas_ = nullptr;
    }
    for (Ecore_Timer** timer : {&quiet_, &deadline_}) {
        if (*timer) {
            ecore_timer_del(*timer);
            *timer = nullptr;
        }
    }
    if (ticker_) {
        ecore_animator_del(ticker_);
        ticker_ = nullptr;
    }
    if (idle_) {
        ecore_idler_del(idle_);
        idle_ = nullptr;
    }
}

void Settling::finish() {
    leave();
    // The listener may destroy this object.
    const std::function<void()> done = std::move(done_);
    guarded(done);
}

void Settling::waitForQuiet() {
    ticks_ = 0;
    if (idle_) {
        ecore_idler_del(idle_);
        idle_ = nullptr;
    }
    if (quiet_) {
        ecore_timer_reset(quiet_);
    } else {
        quiet_ = ecore_timer_add(quietSeconds, onQuiet, this);
    }
}

void Settling::onFrameBegin(void* data, Evas*, void*) {
    static_cast<Settling*>(data)->drawing_ = true;
}

void Settling::onFrameEnd(void* data, Evas*, void* info) {
    auto* self = static_cast<Settling*>(data);
    self->drawing_ = false;
    const auto* frame = static_cast<const Evas_Event_Render_Post*>(info);
    if (frame && frame->updated_area) {
        self->waitForQuiet();
    }
}

void Settling::onCanvasFree(void* data, Evas*, void*) {
    auto* self = static_cast<Settling*>(data);
    self->leave();
}

Eina_Bool Settling::onTick(void* data) {
    ++static_cast<Settling*>(data)->ticks_;
    return ECORE_CALLBACK_RENEW;
}

Eina_Bool Settling::onQuiet(void* data) {
    auto* self = static_cast<Settling*>(data);
    if (self->drawing_ || self->ticks_ < quietTicks) {
        return ECORE_CALLBACK_RENEW;
    }
    // Work that kept the loop busy may be what the next frame shows: the loop must come to rest as well.
    self->quiet_ = nullptr;
    self->idle_ = ecore_idler_add(onIdle, self);
    return ECORE_CALLBACK_CANCEL;
}

Eina_Bool Settling::onIdle(void* data) {
    auto* self = static_cast<Settling*>(data);
    self->idle_ = nullptr;
    if (self->drawing_ || self->scrolls_.isScrolling()) {
        self->waitForQuiet();
    } else {
        self->finish();
    }
    return ECORE_CALLBACK_CANCEL;
}

Eina_Bool Settling::onDeadline(void* data) {
    auto* self = static_cast<Settling*>(data);
    self->deadline_ = nullptr;
    self->finish();
    return ECORE_CALLBACK_CANCEL;
}

}  // namespace remote_control
