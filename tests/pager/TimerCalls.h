#pragma once

#include <Elementary.h>

#include <functional>
#include <vector>

namespace calls {

/// A timer as the pager or a page asked for it. An idler has no seconds.
struct Timer {
    double seconds;
    const Evas_Object* owner;

    bool operator==(const Timer&) const = default;
};

/// The timers and idlers since the last call, in their order.
std::vector<Timer> newTimers();

/// What happens each time an idler has run, if anything.
extern std::function<void()> afterIdler;

}  // namespace calls
