#include "app-assist/WAppEventHandler.h"

#include "AppEvents.h"

#include <utility>
#include <vector>

namespace app_assist {

struct WAppEventHandler::Subscriptions {
    std::vector<AppEvents::Subscription> all;
};

WAppEventHandler::WAppEventHandler() : subscriptions_(std::make_unique<Subscriptions>()) {}

WAppEventHandler::~WAppEventHandler() = default;

void WAppEventHandler::addEventHandler(app_event_type_e type, Handler handler, void* userData) {
    if (!handler)
        return;
    subscriptions_->all.push_back(AppEvents::add(
        type, [handler = std::move(handler), userData](app_event_info_h info) { handler(info, userData); }));
}

}  // namespace app_assist
