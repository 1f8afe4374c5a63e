#include "DesktopService.h"

#include "Requests.h"
#include "device/Bus.h"
#include "device/LaunchRequest.h"
#include "device/OneLine.h"

#include <cstring>
#include <utility>

namespace remote_control {

namespace {

constexpr char interfaceName[] = "org.freedesktop.Application";
constexpr char stateKey[] = "remote-control desktop";

}  // namespace

DesktopService::DesktopService(device::Bus& bus, const std::string& appId, std::optional<device::Link> link,
                               LaunchQueue& queue)
    : appId_(appId), link_(std::move(link)), queue_(queue) {
    static const Eldbus_Method methods[] = {
        {"Activate", ELDBUS_ARGS({"a{sv}", "platform_data"}), nullptr, onActivate, 0},
        {"Open", ELDBUS_ARGS({"as", "uris"}, {"a{sv}", "platform_data"}), nullptr, onOpen, 0},
        {"ActivateAction", ELDBUS_ARGS({"s", "action_name"}, {"av", "parameter"}, {"a{sv}", "platform_data"}), nullptr,
         onActivateAction, 0},
        {}};
    static const Eldbus_Service_Interface_Desc description = {interfaceName, methods, nullptr,
                                                              nullptr,       nullptr, nullptr};
    interface_ = offer(bus, appId, description);
    eldbus_service_object_data_set(interface_, stateKey, this);
}

DesktopService::~DesktopService() {
    eldbus_service_interface_unregister(interface_);
}

DesktopService& DesktopService::of(const Eldbus_Service_Interface* interface) {
    return *static_cast<DesktopService*>(eldbus_service_object_data_get(interface, stateKey));
}

Eldbus_Message* DesktopService::onActivate(const Eldbus_Service_Interface* interface, const Eldbus_Message* request) {
    return answer(request, [&]() -> Eldbus_Message* {
        of(interface).queue_.launch(request, {Server::Extras()});
        return nullptr;
    });
}

Eldbus_Message* DesktopService::onOpen(const Eldbus_Service_Interface* interface, const Eldbus_Message* request) {
    return answer(request, [&]() -> Eldbus_Message* {
        Eldbus_Message_Iter* uris = nullptr;
        Eldbus_Message_Iter* platformData = nullptr;
        arguments(request, "asa{sv}", &uris, &platformData);
        DesktopService& self = of(interface);
        self.queue_.launch(request, self.requestsOf(uris));
        return nullptr;
    });
}

Eldbus_Message* DesktopService::onActivateAction(const Eldbus_Service_Interface* interface,
                                                 const Eldbus_Message* request) {
    return answer(request, [&]() -> Eldbus_Message* {
        const char* action = nullptr;
        Eldbus_Message_Iter* parameter = nullptr;
        Eldbus_Message_Iter* platformData = nullptr;
        arguments(request, "sava{sv}", &action, &parameter, &platformData);
        throw device::Error(of(interface).appId_ + " has no action \"" + device::oneLine(action) + '"');
    });
}

/// Of all links, before anything is done about one.
std::vector<Server::Extras> DesktopService::requestsOf(Eldbus_Message_Iter* uris) const {
    if (!link_) {
        throw device::Error(appId_ + " opens no links");
    }
    std::vector<Server::Extras> requests;
    std::size_t bytes = 0;
    for (const char* uri = nullptr; eldbus_message_iter_get_and_next(uris, 's', &uri);) {
        bytes += std::strlen(uri) + 1;
        if (bytes > device::LaunchRequest::mostBytes) {
            throw device::Error("the argument \"uris\" is larger than 64 KiB");
        }
        requests.push_back(link_->extrasOf(uri));
    }
    if (requests.empty()) {
        throw device::Error("the argument \"uris\" is empty; give a link");
    }
    return requests;
}

}  // namespace remote_control
