#pragma once

#include "device/Bus.h"
#include "device/Error.h"

#include <Eldbus.h>

#include <memory>
#include <string>

namespace remote_control {

inline constexpr char errorName[] = "com.ravella.device.Error.Failed";

struct MessageUnref {
    void operator()(Eldbus_Message* message) const { eldbus_message_unref(message); }
};

/// EFL hands requests out as const; keeping one changes nothing but its counter.
inline std::shared_ptr<Eldbus_Message> keep(const Eldbus_Message* request) {
    return {eldbus_message_ref(const_cast<Eldbus_Message*>(request)), MessageUnref()};
}

/// Exports an interface of the application's object. Throws device::Error when the bus does not take it.
inline Eldbus_Service_Interface* offer(const device::Bus& bus, const std::string& appId,
                                       const Eldbus_Service_Interface_Desc& description) {
    const std::string path = device::bus::pathOf(appId);
    Eldbus_Service_Interface* interface =
        eldbus_service_interface_register(bus.connection(), path.c_str(), &description);
    if (!interface) {
        throw device::Error("cannot offer " + path + " on the device's bus");
    }
    return interface;
}

/// The answer that `work` makes, or an error with what it threw.
template <typename Work>
Eldbus_Message* answer(const Eldbus_Message* request, Work&& work) noexcept {
    try {
        return work();
    } catch (const std::exception& error) {
        return eldbus_message_error_new(request, errorName, error.what());
    }
}

/// The request's arguments. Throws device::Error when they are others.
template <typename... Out>
void arguments(const Eldbus_Message* request, const char* signature, Out... out) {
    if (!eldbus_message_arguments_get(request, signature, out...)) {
        throw device::Error(std::string(eldbus_message_member_get(request)) + " takes the arguments \"" + signature +
                            "\", not \"" + eldbus_message_signature_get(request) + "\"");
    }
}

}  // namespace remote_control
