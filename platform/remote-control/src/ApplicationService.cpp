#include "ApplicationService.h"

#include "Guarded.h"
#include "Requests.h"
#include "device/Bus.h"

#include <array>
#include <charconv>
#include <utility>

namespace remote_control {

namespace {

constexpr char stateKey[] = "remote-control application";

/// The extras of a launch request. Throws device::Error for one without a name.
Server::Extras extrasOf(const Eldbus_Message* request) {
    Eldbus_Message_Iter* all = nullptr;
    arguments(request, "a{ss}", &all);
    Server::Extras extras;
    for (Eldbus_Message_Iter* entry = nullptr; eldbus_message_iter_get_and_next(all, 'e', &entry);) {
        const char* key = nullptr;
        const char* value = nullptr;
        eldbus_message_iter_arguments_get(entry, "ss", &key, &value);
        if (!*key) {
            throw device::Error("an extra of the launch request has no name; give each one");
        }
        extras.emplace_back(key, value);
    }
    return extras;
}

}  // namespace

ApplicationService::ApplicationService(device::Bus& bus, const std::string& appId, std::function<void()> quit,
                                       Server::LaunchHandler launch)
    : bus_(bus), appId_(appId), quit_(std::move(quit)), launch_(std::move(launch)) {
    static const Eldbus_Method methods[] = {
        {"Quit", nullptr, nullptr, onQuit, 0}, {"Launch", ELDBUS_ARGS({"a{ss}", "extras"}), nullptr, onLaunch, 0}, {}};
    static const Eldbus_Property properties[] = {
        {"Folder", "s", folder, nullptr, 0}, {"LastRequest", "s", lastRequest, nullptr, 0}, {}};
    static const Eldbus_Service_Interface_Desc description = {
        device::bus::applicationInterface, methods, nullptr, properties, nullptr, nullptr};
    const std::string path = device::bus::pathOf(appId);
    interface_ = eldbus_service_interface_register(bus.connection(), path.c_str(), &description);
    if (!interface_) {
        throw device::Error("cannot offer " + path + " on the device's bus");
    }
    eldbus_service_object_data_set(interface_, stateKey, this);
}

ApplicationService::~ApplicationService() {
    if (job_) {
        ecore_job_del(job_);
    }
    eldbus_service_interface_unregister(interface_);
}

ApplicationService& ApplicationService::of(const Eldbus_Service_Interface* interface) {
    return *static_cast<ApplicationService*>(eldbus_service_object_data_get(interface, stateKey));
}

void ApplicationService::doLater(std::function<void()> work) {
    waiting_.push_back(std::move(work));
    if (!job_) {
        job_ = ecore_job_add(doNext, this);
    }
}

/// One a turn, because what is done may destroy this object.
void ApplicationService::doNext(void* service) {
    auto* self = static_cast<ApplicationService*>(service);
    const std::function<void()> work = std::move(self->waiting_.front());
    self->waiting_.pop_front();
    self->job_ = self->waiting_.empty() ? nullptr : ecore_job_add(doNext, self);
    guarded(work);
}

Eldbus_Message* ApplicationService::onQuit(const Eldbus_Service_Interface* interface, const Eldbus_Message* request) {
    of(interface).doLater(of(interface).quit_);
    return eldbus_message_method_return_new(request);
}

Eldbus_Message* ApplicationService::onLaunch(const Eldbus_Service_Interface* interface, const Eldbus_Message* request) {
    return answer(request, [&] {
        ApplicationService& self = of(interface);
        if (!self.launch_) {
            throw device::Error(self.appId_ + " takes no launch requests while it runs");
        }
        self.lastRequest_ = device::secondsSinceBoot();
        self.doLater([&self, extras = extrasOf(request)] { self.launch_(extras); });
        return eldbus_message_method_return_new(request);
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
    std::to_chars(text.data(), text.data() + text.size() - 1, of(interface).lastRequest_);
    return eldbus_message_iter_basic_append(value, 's', text.data());
}

}  // namespace remote_control
