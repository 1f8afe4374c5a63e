#pragma once

#include "ui_extension.h"

#include <cstdint>
#include <vector>

namespace uxt {

/// Who wants to hear of theme changes, oldest first.
class ChangedCallbacks {
public:
    static ChangedCallbacks& ofProcess();

    void add(const Evas_Object* object, uxt_theme_changed_cb callback, void* data);
    /// Removes the oldest registration of the callback for that object; false when there is none.
    bool remove(const Evas_Object* object, uxt_theme_changed_cb callback);
    /// Calls those that are registered now. A callback may add and remove: what is removed before its turn is not
    /// called, what is added waits for the next time.
    void call();

private:
    struct Registration {
        std::uint64_t number;
        const Evas_Object* object;
        uxt_theme_changed_cb callback;
        void* data;
    };

    std::vector<Registration> registrations_;
    std::uint64_t lastNumber_ = 0;
};

}  // namespace uxt
