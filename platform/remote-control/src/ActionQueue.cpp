#include "ActionQueue.h"

#include "Guarded.h"
#include "device/Error.h"

namespace remote_control {

namespace {

constexpr char closed[] = "the application closed its window before the request was carried out";

}  // namespace

ActionQueue::~ActionQueue() {
    const bool carriedOut = settling_ != nullptr;
    forgetCanvas();
    playback_.reset();
    settling_.reset();
    scrolls_.reset();
    bool first = true;
    for (const Action& action : actions_) {
        guarded([&] { action.done(first && carriedOut ? "" : closed); });
        first = false;
    }
}

void ActionQueue::add(Action action) {
    actions_.push_back(std::move(action));
    if (actions_.size() == 1) {
        begin();
    }
}

void ActionQueue::begin() {
    std::string error;
    try {
        Evas* canvas = canvasOfNow_();
        std::vector<Playback::Step> steps = actions_.front().steps(canvas);
        canvas_ = canvas;
        evas_event_callback_add(canvas_, EVAS_CALLBACK_FREE, onCanvasFree, this);
        scrolls_ = std::make_unique<ScrollWatch>(canvas_);
        playback_ = std::make_unique<Playback>(std::move(steps), [this] { settle(); });
        return;
    } catch (const std::exception& failure) {
        error = failure.what();
    }
    end(error);
}

void ActionQueue::settle() {
    settling_ = std::make_unique<Settling>(canvas_, *scrolls_, [this] { end(""); });
    playback_.reset();
}

void ActionQueue::end(const std::string& error) {
    forgetCanvas();
    playback_.reset();
    settling_.reset();
    scrolls_.reset();
    const Action action = std::move(actions_.front());
    actions_.pop_front();
    action.done(error);
    if (!actions_.empty()) {
        begin();
    }
}

void ActionQueue::forgetCanvas() {
    if (canvas_) {
        evas_event_callback_del_full(canvas_, EVAS_CALLBACK_FREE, onCanvasFree, this);
        canvas_ = nullptr;
    }
}

void ActionQueue::onCanvasFree(void* data, Evas*, void*) {
    auto* self = static_cast<ActionQueue*>(data);
    guarded([self] { self->end(self->settling_ ? "" : closed); });
}

}  // namespace remote_control
