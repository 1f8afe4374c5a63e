#include "AppEvents.h"

#include "Guarded.h"

#include <utility>
#include <vector>

struct app_event_info {
    app_event_type_e type;
};

namespace app_assist {

namespace {

struct Entry {
    app_event_type_e type;
    AppEvents::Handler handler;
};

std::vector<std::weak_ptr<Entry>>& entries() {
    static std::vector<std::weak_ptr<Entry>> all;
    return all;
}

}  // namespace

AppEvents::Subscription AppEvents::add(app_event_type_e type, Handler handler) {
    auto entry = std::make_shared<Entry>(Entry{type, std::move(handler)});
    std::erase_if(entries(), [](const auto& each) { return each.expired(); });
    entries().push_back(entry);
    return entry;
}

void AppEvents::dispatch(app_event_type_e type) {
    app_event_info info{type};
    const auto now = entries();
    for (const auto& each : now) {
        const auto entry = each.lock();
        if (entry && entry->type == type)
            guarded("an event handler", [&] { entry->handler(&info); });
    }
}

}  // namespace app_assist
