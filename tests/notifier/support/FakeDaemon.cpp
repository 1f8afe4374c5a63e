#include "FakeDaemon.h"

#include "device/BusName.h"

#include <stdexcept>
#include <utility>

namespace support {

namespace {

constexpr char stateKey[] = "fake daemon";

constexpr Eldbus_Arg_Info capabilityList[] = {{"as", "capabilities"}, {}};
constexpr Eldbus_Arg_Info oneNumber[] = {{"u", "number"}, {}};
constexpr Eldbus_Arg_Info notifyArguments[] = {{"s", "application"}, {"u", "replaces"},     {"s", "icon"},
                                               {"s", "title"},       {"s", "text"},         {"as", "actions"},
                                               {"a{sv}", "hints"},   {"i", "milliseconds"}, {}};
constexpr Eldbus_Arg_Info actionArguments[] = {{"u", "number"}, {"s", "action"}, {}};
constexpr Eldbus_Arg_Info closeArguments[] = {{"u", "number"}, {"u", "reason"}, {}};

enum Signal { actionInvoked, notificationClosed };

std::vector<std::string> textsOf(Eldbus_Message_Iter* list) {
    std::vector<std::string> texts;
    for (const char* text = nullptr; eldbus_message_iter_get_and_next(list, 's', &text);)
        texts.emplace_back(text);
    return texts;
}

/// The value of a hint that is a text.
std::string hint(Eldbus_Message_Iter* hints, const std::string& wanted) {
    std::string value;
    Eldbus_Message_Iter* entry = nullptr;
    while (eldbus_message_iter_get_and_next(hints, 'e', &entry)) {
        const char* key = nullptr;
        const char* text = nullptr;
        Eldbus_Message_Iter* variant = nullptr;
        eldbus_message_iter_arguments_get(entry, "sv", &key, &variant);
        if (key == wanted && eldbus_message_iter_arguments_get(variant, "s", &text))
            value = text;
    }
    return value;
}

}  // namespace

FakeDaemon::FakeDaemon(const device::Folder& folder, std::vector<std::string> capabilities)
    : bus_(device::Bus::connect(folder)), capabilities_(std::move(capabilities)) {
    if (!bus_)
        throw std::runtime_error("there is no bus for the fake daemon");
    static const Eldbus_Method methods[] = {{"GetCapabilities", nullptr, capabilityList, onCapabilities, 0},
                                            {"Notify", notifyArguments, oneNumber, onNotifyCall, 0},
                                            {"CloseNotification", oneNumber, nullptr, onClose, 0},
                                            {}};
    static const Eldbus_Signal signals[] = {
        {"ActionInvoked", actionArguments, 0}, {"NotificationClosed", closeArguments, 0}, {}};
    static const Eldbus_Service_Interface_Desc description = {name, methods, signals, nullptr, nullptr, nullptr};
    interface_ = eldbus_service_interface_register(bus_->connection(), "/org/freedesktop/Notifications", &description);
    eldbus_service_object_data_set(interface_, stateKey, this);
    device::BusName::own(*bus_, name, false);
}

FakeDaemon::~FakeDaemon() {
    eldbus_service_interface_unregister(interface_);
}

void FakeDaemon::invoke(std::uint32_t number, const std::string& action) const {
    eldbus_service_signal_emit(interface_, actionInvoked, number, action.c_str());
}

void FakeDaemon::close(std::uint32_t number, std::uint32_t reason) const {
    eldbus_service_signal_emit(interface_, notificationClosed, number, reason);
}

FakeDaemon& FakeDaemon::of(const Eldbus_Service_Interface* interface) {
    return *static_cast<FakeDaemon*>(eldbus_service_object_data_get(interface, stateKey));
}

Eldbus_Message* FakeDaemon::answer(const Eldbus_Message* call, const char* method,
                                   const std::function<void(Eldbus_Message*)>& fill) {
    if (ignored_ == method)
        return nullptr;
    Eldbus_Message* message = eldbus_message_method_return_new(call);
    fill(message);
    return message;
}

Eldbus_Message* FakeDaemon::onCapabilities(const Eldbus_Service_Interface* interface, const Eldbus_Message* call) {
    return of(interface).answer(call, "GetCapabilities", [&](Eldbus_Message* message) {
        Eldbus_Message_Iter* iterator = eldbus_message_iter_get(message);
        Eldbus_Message_Iter* list = nullptr;
        eldbus_message_iter_arguments_append(iterator, "as", &list);
        for (const std::string& capability : of(interface).capabilities_)
            eldbus_message_iter_basic_append(list, 's', capability.c_str());
        eldbus_message_iter_container_close(iterator, list);
    });
}

Eldbus_Message* FakeDaemon::onNotifyCall(const Eldbus_Service_Interface* interface, const Eldbus_Message* call) {
    FakeDaemon& self = of(interface);
    const char* application = "";
    const char* icon = "";
    const char* title = "";
    const char* text = "";
    Eldbus_Message_Iter* actions = nullptr;
    Eldbus_Message_Iter* hints = nullptr;
    Call made;
    if (!eldbus_message_arguments_get(call, "susssasa{sv}i", &application, &made.replaces, &icon, &title, &text,
                                      &actions, &hints, &made.milliseconds))
        return eldbus_message_error_new(call, "org.freedesktop.DBus.Error.InvalidArgs", "Notify");
    made.application = application;
    made.icon = icon;
    made.title = title;
    made.text = text;
    made.actions = textsOf(actions);
    made.desktopEntry = hint(hints, "desktop-entry");
    self.calls_.push_back(made);
    if (self.notified_)
        self.notified_();
    const std::uint32_t number = made.replaces != 0 ? made.replaces : self.next_++;
    return self.answer(call, "Notify",
                       [&](Eldbus_Message* message) { eldbus_message_arguments_append(message, "u", number); });
}

Eldbus_Message* FakeDaemon::onClose(const Eldbus_Service_Interface* interface, const Eldbus_Message* call) {
    FakeDaemon& self = of(interface);
    std::uint32_t number = 0;
    if (!eldbus_message_arguments_get(call, "u", &number))
        return eldbus_message_error_new(call, "org.freedesktop.DBus.Error.InvalidArgs", "CloseNotification");
    self.closed_.push_back(number);
    self.close(number, 3);
    return self.answer(call, "CloseNotification", [](Eldbus_Message*) {});
}

}  // namespace support
