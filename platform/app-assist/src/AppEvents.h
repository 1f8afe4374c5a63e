#pragma once

#include <app_common.h>

#include <functional>
#include <memory>

namespace app_assist {

/// The application's events (language, region format, ...) on their way to who asked for them.
class AppEvents {
public:
    using Handler = std::function<void(app_event_info_h)>;
    /// Ends its subscription when it is destroyed, also while handlers run.
    using Subscription = std::shared_ptr<void>;

    [[nodiscard]] static Subscription add(app_event_type_e type, Handler handler);
    /// Calls the handlers of that type in the order in which they were added.
    static void dispatch(app_event_type_e type);
};

}  // namespace app_assist
