#include "ui/Clock.h"

#include <Ecore.h>
#include <Elementary.h>

#include <dlfcn.h>
#include <sys/select.h>
#include <time.h>

namespace {

constexpr double frame = 1.0 / 60;
/// Deadlines must never be equal, as they never are in reality: the loop runs equal ones last added first.
constexpr double instant = 1e-7;

bool started = false;
bool ended = false;
double now = 1000.0;

bool ticking = false;
Ecore_Timer* tickTimer = nullptr;

Eina_Bool tick(void*) {
    if (ticking)
        ecore_animator_custom_tick();
    return ECORE_CALLBACK_RENEW;
}

// One permanent timer keeps the frames on a fixed grid: scrollers take their animator off and on again at every
// move of the pointer, and a timer that is made anew each time would never come due.
void beginTicking(void*) {
    ticking = true;
    if (!tickTimer)
        tickTimer = ecore_timer_loop_add(frame, tick, nullptr);
}

void endTicking(void*) {
    ticking = false;
}

/// Waiting is a jump of the clock; only where nothing is due do we wait for another process, a little at a time.
int selectOnOwnClock(int count, fd_set* readable, fd_set* writable, fd_set* failed, timeval* timeout) {
    const fd_set readableBefore = *readable, writableBefore = *writable, failedBefore = *failed;
    timeval none = {0, 0};
    if (const int ready = select(count, readable, writable, failed, &none))
        return ready;
    if (timeout) {
        now += static_cast<double>(timeout->tv_sec) + static_cast<double>(timeout->tv_usec) * 1e-6 + 1e-6;
        FD_ZERO(readable);
        FD_ZERO(writable);
        FD_ZERO(failed);
        return 0;
    }
    *readable = readableBefore, *writable = writableBefore, *failed = failedBefore;
    timeval little = {0, 5000};
    return select(count, readable, writable, failed, &little);
}

}  // namespace

/// The program's definition comes before the library's own, also for the library itself.
extern "C" __attribute__((visibility("default"))) double ecore_time_get(void) {
    if (started)
        return now += instant;
    timespec time;
    clock_gettime(CLOCK_MONOTONIC, &time);
    return static_cast<double>(time.tv_sec) + static_cast<double>(time.tv_nsec) * 1e-9;
}

/// Noted here, as a loop that a test and the application end in one turn looks like one that the test alone ended.
extern "C" __attribute__((visibility("default"))) void elm_exit(void) {
    ended = true;
    reinterpret_cast<decltype(&elm_exit)>(dlsym(RTLD_NEXT, "elm_exit"))();
}

namespace test_ui::clock {

void start() {
    started = true;
    ended = false;
}

void driveMainLoop() {
    ecore_main_loop_select_func_set(selectOnOwnClock);
}

void driveAnimations() {
    ecore_animator_custom_source_tick_begin_callback_set(beginTicking, nullptr);
    ecore_animator_custom_source_tick_end_callback_set(endTicking, nullptr);
    ecore_animator_source_set(ECORE_ANIMATOR_SOURCE_CUSTOM);
}

void stop() {
    if (tickTimer)
        ecore_timer_del(tickTimer);
    tickTimer = nullptr;
    ticking = false;
}

bool isAnimating() {
    return ticking;
}

unsigned int timestamp() {
    return static_cast<unsigned int>(ecore_time_get() * 1000.0);
}

}  // namespace test_ui::clock

namespace test_ui {

bool runFor(double seconds) {
    clock::driveAnimations();
    bool over = false;
    Ecore_Timer* timer = ecore_timer_add(
        seconds,
        [](void* data) -> Eina_Bool {
            *static_cast<bool*>(data) = true;
            ecore_main_loop_quit();
            return ECORE_CALLBACK_CANCEL;
        },
        &over);
    ecore_main_loop_begin();
    if (!over)
        ecore_timer_del(timer);
    ended = ended || !over;
    return over;
}

void inMainLoop(const std::function<void()>& function) {
    struct Call {
        const std::function<void()>& function;
        bool done = false;
    } call{function};
    ecore_job_add(
        [](void* data) {
            auto* due = static_cast<Call*>(data);
            due->function();
            due->done = true;
        },
        &call);
    while (!call.done)
        runFor(0.0);
}

bool hasEnded() {
    return ended;
}

bool runUntil(const std::function<bool()>& condition, double seconds) {
    for (double waited = 0; !condition(); waited += frame) {
        if (waited > seconds)
            return false;
        runFor(frame);
    }
    return true;
}

}  // namespace test_ui
