#include "TimerCalls.h"

#include "Calls.h"

#include <app-assist/WUiTimer.h>

#include <utility>

using app_assist::WUiTimer;
using app_assist::WView;

namespace {

std::vector<calls::Timer> timers;

}  // namespace

std::vector<calls::Timer> calls::newTimers() {
    return std::exchange(timers, {});
}

std::function<void()> calls::afterIdler;

// WUiTimer::addTimer() and addIdler(), which the linker knows by these names.
#define ADD_TIMER "_ZN10app_assist8WUiTimer8addTimerEdSt8functionIFbPNS_5WViewEEES3_P10_Eo_Opaque"
#define ADD_IDLER "_ZN10app_assist8WUiTimer8addIdlerESt8functionIFbPNS_5WViewEEES3_P10_Eo_Opaque"

WUiTimer::Handle addTimer(double seconds, WUiTimer::Function function, WView* view,
                          Evas_Object* owner) __asm__("__real_" ADD_TIMER);
WUiTimer::Handle addAndNoteTimer(double seconds, WUiTimer::Function function, WView* view,
                                 Evas_Object* owner) __asm__("__wrap_" ADD_TIMER);
WUiTimer::Handle addIdler(WUiTimer::Function function, WView* view, Evas_Object* owner) __asm__("__real_" ADD_IDLER);
WUiTimer::Handle addAndNoteIdler(WUiTimer::Function function, WView* view,
                                 Evas_Object* owner) __asm__("__wrap_" ADD_IDLER);

WUiTimer::Handle addAndNoteTimer(double seconds, WUiTimer::Function function, WView* view, Evas_Object* owner) {
    calls::throwIfDue("addTimer");
    timers.push_back({seconds, owner});
    return addTimer(seconds, std::move(function), view, owner);
}

WUiTimer::Handle addAndNoteIdler(WUiTimer::Function function, WView* view, Evas_Object* owner) {
    timers.push_back({0, owner});
    const auto noted = [function = std::move(function)](WView* each) {
        const bool again = function(each);
        if (calls::afterIdler)
            calls::afterIdler();
        return again;
    };
    return addIdler(noted, view, owner);
}
