#pragma once

#include <Evas.h>

#include <functional>
#include <memory>

namespace app_assist {

class WView;

/// Work for later on the main loop. The framework owns the timers; callers hold weak handles.
/// A timer ends when its function returns false, when it is destroyed, or when its view or its owner object goes:
/// then its function is not called again.
class WUiTimer {
public:
    /// Gets the view that was given at registration. True: again (jobs run once anyway); false: end.
    using Function = std::function<bool(WView*)>;
    using Handle = std::weak_ptr<WUiTimer>;

    /// Calls `function` every `seconds`. `view` and `owner` may be null.
    static Handle addTimer(double seconds, Function function, WView* view, Evas_Object* owner);
    /// Calls `function` when the main loop is next idle.
    static Handle addIdler(Function function, WView* view, Evas_Object* owner);
    /// Calls `function` once, after the callback that runs now has returned.
    static Handle addJob(Function function, WView* view, Evas_Object* owner);
    /// Ends a timer; the function is not called again. Harmless on a handle whose timer has ended.
    static void destroy(const Handle& handle);

    ~WUiTimer();
    WUiTimer(const WUiTimer&) = delete;
    WUiTimer& operator=(const WUiTimer&) = delete;

private:
    friend class UiTimers;
    struct State;
    explicit WUiTimer(std::unique_ptr<State> state);
    std::unique_ptr<State> state_;
};

}  // namespace app_assist
