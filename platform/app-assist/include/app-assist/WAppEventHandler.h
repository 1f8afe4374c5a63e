#pragma once

#include <app_common.h>

#include <functional>
#include <memory>

namespace app_assist {

/// Subscriptions to the application's events, for as long as this object lives.
class WAppEventHandler {
public:
    using Handler = std::function<void(app_event_info_h, void*)>;

    WAppEventHandler();
    ~WAppEventHandler();
    WAppEventHandler(const WAppEventHandler&) = delete;
    WAppEventHandler& operator=(const WAppEventHandler&) = delete;

    /// Calls `handler` with `userData` on the main loop's thread at every event of that type.
    void addEventHandler(app_event_type_e type, Handler handler, void* userData);

private:
    struct Subscriptions;
    std::unique_ptr<Subscriptions> subscriptions_;
};

}  // namespace app_assist
