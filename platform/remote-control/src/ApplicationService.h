#pragma once

#include "LaunchQueue.h"

#include <Eldbus.h>

#include <functional>
#include <string>

namespace remote_control {

/// The interface com.ravella.device.Application on the bus: which device the application belongs to, its end,
/// launch requests to it, and when the last one came.
class ApplicationService {
public:
    /// Throws device::Error when the bus does not take the object. The queue outlives this object.
    ApplicationService(device::Bus& bus, const std::string& appId, std::function<void()> quit, LaunchQueue& queue);
    ~ApplicationService();
    ApplicationService(const ApplicationService&) = delete;
    ApplicationService& operator=(const ApplicationService&) = delete;

private:
    static ApplicationService& of(const Eldbus_Service_Interface* interface);
    static Eldbus_Message* onQuit(const Eldbus_Service_Interface* interface, const Eldbus_Message* request);
    static Eldbus_Message* onLaunch(const Eldbus_Service_Interface* interface, const Eldbus_Message* request);
    static Eina_Bool folder(const Eldbus_Service_Interface* interface, const char* property, Eldbus_Message_Iter* value,
                            const Eldbus_Message* request, Eldbus_Message** error);
    static Eina_Bool lastRequest(const Eldbus_Service_Interface* interface, const char* property,
                                 Eldbus_Message_Iter* value, const Eldbus_Message* request, Eldbus_Message** error);

    device::Bus& bus_;
    const std::string appId_;
    const std::function<void()> quit_;
    LaunchQueue& queue_;
    Eldbus_Service_Interface* interface_ = nullptr;
};

}  // namespace remote_control
