#include "Playback.h"

#include "Guarded.h"

namespace remote_control {

Playback::Playback(std::vector<Step> steps, std::function<void()> done)
    : steps_(std::move(steps)), done_(std::move(done)) {
    waitForNext();
}

Playback::~Playback() {
    *alive_ = false;
    if (timer_) {
        ecore_timer_del(timer_);
    }
}

void Playback::waitForNext() {
    timer_ = ecore_timer_add(next_ < steps_.size() ? steps_[next_].after : 0.0, onTimer, this);
}

Eina_Bool Playback::onTimer(void* data) {
    auto* self = static_cast<Playback*>(data);
    self->timer_ = nullptr;
    guarded([self] {
        if (self->next_ == self->steps_.size()) {
            // The listener may destroy this object.
            const std::function<void()> done = std::move(self->done_);
            done();
            return;
        }
        const std::shared_ptr<bool> alive = self->alive_;
        const Step step = std::move(self->steps_[self->next_++]);
        step.run();
        // A step can close the window, and that ends the playback.
        if (*alive) {
            self->waitForNext();
        }
    });
    return ECORE_CALLBACK_CANCEL;
}

}  // namespace remote_control
