#include "app-assist/WUiTimer.h"

#include "Guarded.h"
#include "UiTimers.h"

#include <Ecore.h>

#include <algorithm>
#include <utility>
#include <vector>

namespace app_assist {

namespace {

enum class Kind { Timer, Idler, Job };

using Timers = std::vector<std::shared_ptr<WUiTimer>>;

Timers& running() {
    static Timers timers;
    return timers;
}

}  // namespace

struct WUiTimer::State {
    Kind kind;
    double seconds;
    Function function;
    WView* view;
    Evas_Object* owner;
    /// Of the kind that `kind` says; null when nothing is registered with the main loop.
    void* handle = nullptr;
    bool inFunction = false;

    static Handle start(Kind kind, double seconds, Function function, WView* view, Evas_Object* owner);
    static void end(WUiTimer& timer);
    static bool run(void* timer);
    static void ownerGoes(void* timer, Evas*, Evas_Object*, void*);

    void registerWith(WUiTimer* timer);
    void unregister();
};

WUiTimer::WUiTimer(std::unique_ptr<State> state) : state_(std::move(state)) {}

WUiTimer::~WUiTimer() = default;

WUiTimer::Handle WUiTimer::State::start(Kind kind, double seconds, Function function, WView* view, Evas_Object* owner) {
    if (!function)
        return {};
    auto state = std::make_unique<State>(State{kind, seconds, std::move(function), view, owner});
    const std::shared_ptr<WUiTimer> timer(new WUiTimer(std::move(state)));
    running().push_back(timer);
    timer->state_->registerWith(timer.get());
    return timer;
}

void WUiTimer::State::registerWith(WUiTimer* timer) {
    if (kind == Kind::Timer)
        handle = ecore_timer_add(
            seconds, [](void* data) -> Eina_Bool { return run(data); }, timer);
    else if (kind == Kind::Idler)
        handle = ecore_idler_add([](void* data) -> Eina_Bool { return run(data); }, timer);
    else
        handle = ecore_job_add([](void* data) { run(data); }, timer);
    if (owner)
        evas_object_event_callback_add(owner, EVAS_CALLBACK_DEL, ownerGoes, timer);
}

void WUiTimer::State::unregister() {
    // The main loop forgets by itself what is running and does not ask to run again.
    void* registered = std::exchange(handle, nullptr);
    if (!registered || inFunction)
        return;
    if (kind == Kind::Timer)
        ecore_timer_del(static_cast<Ecore_Timer*>(registered));
    else if (kind == Kind::Idler)
        ecore_idler_del(static_cast<Ecore_Idler*>(registered));
    else
        ecore_job_del(static_cast<Ecore_Job*>(registered));
}

bool WUiTimer::State::run(void* data) {
    auto& timers = running();
    const auto found =
        std::find_if(timers.begin(), timers.end(), [data](const auto& timer) { return timer.get() == data; });
    if (found == timers.end())
        return false;
    // Keeps the function that runs alive when it ends its own timer or deletes its view.
    const std::shared_ptr<WUiTimer> timer = *found;
    State& state = *timer->state_;
    state.inFunction = true;
    bool again = false;
    guarded("a timer's function", [&] { again = state.function(state.view); });
    state.inFunction = false;
    const bool ended = !state.handle;
    if (!ended && again && state.kind != Kind::Job)
        return true;
    if (!ended) {
        state.handle = nullptr;
        end(*timer);
    }
    return false;
}

void WUiTimer::State::end(WUiTimer& timer) {
    State& state = *timer.state_;
    state.unregister();
    if (Evas_Object* object = std::exchange(state.owner, nullptr))
        evas_object_event_callback_del_full(object, EVAS_CALLBACK_DEL, ownerGoes, &timer);
    auto& timers = running();
    const auto found =
        std::find_if(timers.begin(), timers.end(), [&timer](const auto& each) { return each.get() == &timer; });
    if (found == timers.end())
        return;
    // The function's captures go last: they may end other timers.
    const std::shared_ptr<WUiTimer> last = std::move(*found);
    timers.erase(found);
}

void WUiTimer::State::ownerGoes(void* data, Evas*, Evas_Object*, void*) {
    auto* timer = static_cast<WUiTimer*>(data);
    timer->state_->owner = nullptr;
    end(*timer);
}

WUiTimer::Handle WUiTimer::addTimer(double seconds, Function function, WView* view, Evas_Object* owner) {
    return State::start(Kind::Timer, seconds, std::move(function), view, owner);
}

WUiTimer::Handle WUiTimer::addIdler(Function function, WView* view, Evas_Object* owner) {
    return State::start(Kind::Idler, 0, std::move(function), view, owner);
}

WUiTimer::Handle WUiTimer::addJob(Function function, WView* view, Evas_Object* owner) {
    return State::start(Kind::Job, 0, std::move(function), view, owner);
}

void WUiTimer::destroy(const Handle& handle) {
    if (const auto timer = handle.lock(); timer && timer->state_->handle)
        State::end(*timer);
}

void UiTimers::endOf(const WView* view) {
    const Timers timers = running();
    for (const auto& timer : timers) {
        if (timer->state_->handle && timer->state_->view == view)
            WUiTimer::State::end(*timer);
    }
}

void UiTimers::endAll() {
    const Timers timers = running();
    for (const auto& timer : timers) {
        if (timer->state_->handle)
            WUiTimer::State::end(*timer);
    }
}

}  // namespace app_assist
