#pragma once

#include <Elementary.h>

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

}  // namespace calls
