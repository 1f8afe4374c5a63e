#pragma once

#include "LaunchQueue.h"
#include "device/Link.h"

#include <Eldbus.h>

#include <optional>
#include <string>

namespace remote_control {

/// The interface org.freedesktop.Application on the bus, as desktops start applications and hand them links. What a
/// desktop says about itself (its "platform data") does not matter here.
class DesktopService {
public:
    /// Throws device::Error when the bus does not take the object. The queue outlives this object.
    DesktopService(device::Bus& bus, const std::string& appId, std::optional<device::Link> link, LaunchQueue& queue);
    ~DesktopService();
    DesktopService(const DesktopService&) = delete;
    DesktopService& operator=(const DesktopService&) = delete;

private:
    using Method = Eldbus_Message*(const Eldbus_Service_Interface*, const Eldbus_Message*);
    static Method onActivate, onOpen, onActivateAction;
    static DesktopService& of(const Eldbus_Service_Interface* interface);
    std::vector<Server::Extras> requestsOf(Eldbus_Message_Iter* uris) const;

    const std::string appId_;
    const std::optional<device::Link> link_;
    LaunchQueue& queue_;
    Eldbus_Service_Interface* interface_ = nullptr;
};

}  // namespace remote_control
