#include "ChangedCallbacks.h"

#include <algorithm>

namespace uxt {

ChangedCallbacks& ChangedCallbacks::ofProcess() {
    static ChangedCallbacks callbacks;
    return callbacks;
}

void ChangedCallbacks::add(const Evas_Object* object, uxt_theme_changed_cb callback, void* data) {
    registrations_.push_back({++lastNumber_, object, callback, data});
}

bool ChangedCallbacks::remove(const Evas_Object* object, uxt_theme_changed_cb callback) {
    const auto found = std::find_if(registrations_.begin(), registrations_.end(), [&](const Registration& each) {
        return each.object == object && each.callback == callback;
    });
    if (found == registrations_.end())
        return false;
    registrations_.erase(found);
    return true;
}

void ChangedCallbacks::call() {
    // A copy, since callbacks may change the list; the number tells which of the copy are still registered.
    const std::vector<Registration> now = registrations_;
    for (const Registration& each : now) {
        const bool isRegistered = std::any_of(registrations_.begin(), registrations_.end(),
                                              [&](const Registration& other) { return other.number == each.number; });
        if (isRegistered)
            each.callback(each.data);
    }
}

}  // namespace uxt
