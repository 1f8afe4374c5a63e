#include "LoopWatch.h"

#include <sys/select.h>

namespace bench {

LoopWatch& LoopWatch::get() {
    static LoopWatch watch;
    return watch;
}

void LoopWatch::begin() {
    began_ = Cost::ofThread();
    ecore_main_loop_select_func_set(wait);
}

Cost LoopWatch::work() const {
    return done_ + (Cost::ofThread() - began_);
}

void LoopWatch::endTurn() {
    const Cost all = work();
    turn_.cost = all - done_;
    done_ = all;
    turns_.push_back(turn_);
    turn_ = {};
}

int LoopWatch::wait(int count, fd_set* readable, fd_set* writable, fd_set* failed, timeval* timeout) {
    LoopWatch& self = get();
    self.endTurn();
    timeval atOnce{};
    if (self.isSo_ && self.isSo_()) {
        ecore_main_loop_quit();
        timeout = &atOnce;
    }
    const int ready = select(count, readable, writable, failed, timeout);
    self.began_ = Cost::ofThread();
    return ready;
}

void LoopWatch::runFor(double seconds) {
    runUntil([] { return false; }, seconds);
}

bool LoopWatch::runUntil(const std::function<bool()>& isSo, double seconds) {
    bool timeIsUp = false;
    const auto quit = [](void* data) -> Eina_Bool {
        *static_cast<bool*>(data) = true;
        ecore_main_loop_quit();
        return ECORE_CALLBACK_CANCEL;
    };
    Ecore_Timer* end = ecore_timer_add(seconds, quit, &timeIsUp);
    isSo_ = isSo;
    ecore_main_loop_begin();
    isSo_ = nullptr;
    if (!timeIsUp) {
        ecore_timer_del(end);
    }
    return isSo();
}

}  // namespace bench
