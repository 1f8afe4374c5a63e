#include "ApplicationService.h"

#include "Requests.h"
#include "device/Bus.h"
#include "device/LaunchRequest.h"

#include <array>
#include <charconv>
#include <cstring>
#include <utility>

namespace remote_control {

namespace {

constexpr char stateKey[] = "remote-control application";

/// The extras of a launch request. Throws device::Error for those that cannot be passed on.
Server::Extras extrasOf(const Eldbus_Message* call, const std::string& appId) {
    Eldbus_Message_Iter* all = nullptr;
    arguments(call, "a{ss}", &all);
    device::LaunchRequest request{"", appId, {}};
    std::size_t bytes = 0;
    Eldbus_Message_Iter* entry = nullptr;
    // What is too large need not be read to its end.
    while (bytes <= device::LaunchRequest::mostBytes && eldbus_message_iter_get_and_next(all, 'e', &entry)) {
        const char* key = nullptr;
        const char* value = nullptr;
        eldbus_message_iter_arguments_get(entry, "ss", &key, &value);
        bytes += std::strlen(key) + std::strlen(value) + 1;
        request.extras.emplace_back(key, value);
    }
    if (const std::string fault = device::faultOf(request); !fault.empty()) {
        throw device::Error(fault);
    }
    return request.extras;
}

}  // namespace

ApplicationService::ApplicationService(device::Bus& bus, const std::string& appId, std::function<void()> quit,
                                       LaunchQueue& queue)
    : bus_(bus), appId_(appId), quit_(std::move(quit)), queue_(queue) {
    static const Eldbus_Method methods[] = {
        {"Quit", nullptr, nullptr, onQuit, 0}, {"Launch", ELDBUS_ARGS({"a{ss}", "extras"}), nullptr, onLaunch, 0}, {}};
    static const Eldbus_Property properties[] = {
        {"Folder", "s", folder, nullptr, 0}, {"LastRequest", "s", lastRequest, nullptr, 0}, {}};
    static const Eldbus_Service_Interface_Desc description = {
        device::bus::applicationInterface, methods, nullptr, properties, nullptr, nullptr};
    interface_ = offer(bus, appId, description);
    eldbus_service_object_data_set(interface_, stateKey, this);
}

ApplicationService::~ApplicationService() {
    eldbus_service_interface_unregister(interface_);
}

ApplicationService& ApplicationService::of(const Eldbus_Service_Interface* interface) {
    return *static_cast<ApplicationService*>(eldbus_service_object_data_get(interface, stateKey));
}

Eldbus_Message* ApplicationService::onQuit(const Eldbus_Service_Interface* interface, const Eldbus_Message* request) {
    of(interface).queue_.add(of(interface).quit_);
    return eldbus_message_method_return_new(request);
}

Eldbus_Message* ApplicationService::onLaunch(const Eldbus_Service_Interface* interface, const Eldbus_Message* request) {
    return answer(request, [&]() -> Eldbus_Message* {
        ApplicationService& self = of(interface);
        self.queue_.launch(request, {extrasOf(request, self.appId_)});
        return nullptr;
    });
}

Eina_Bool ApplicationService::folder(const Eldbus_Service_Interface* interface, const char*, Eldbus_Message_Iter* value,
                                     const Eldbus_Message*, Eldbus_Message**) {
    return eldbus_message_iter_basic_append(value, 's', of(interface).bus_.folder().root().c_str());
}

/// In a form that no language has a say in.
Eina_Bool ApplicationService::lastRequest(const Eldbus_Service_Interface* interface, const char*,
                                          Eldbus_Message_Iter* value, const Eldbus_Message*, Eldbus_Message**) {
    std::array<char, 32> text{};
    std::to_chars(text.data(), text.data() + text.size() - 1, of(interface).queue_.lastRequest());
    return eldbus_message_iter_basic_append(value, 's', text.data());
}

}  // namespace remote_control
