#include "device/BusName.h"

#include "BlockingConnection.h"
#include "device/Bus.h"
#include "device/Error.h"

#include <algorithm>
#include <tuple>

namespace device {
namespace {

constexpr std::chrono::seconds timeout{5};

void mustBeValid(const std::string& name) {
    if (!BusName::isValid(name))
        throw Error("\"" + name +
                    "\" is no name of an application; it needs two or more words of letters, digits, "
                    "'-' and '_', joined by dots");
}

Message aboutName(const char* method, const std::string& name) {
    Message call = BlockingConnection::callOfBus(method);
    const char* text = name.c_str();
    dbus_message_append_args(call.get(), DBUS_TYPE_STRING, &text, DBUS_TYPE_INVALID);
    return call;
}

}  // namespace

BusName::Result BusName::own(const Bus& bus, const std::string& name, bool queue) {
    mustBeValid(name);
    std::ignore = bus.blocking();
    switch (bus.requestName(name, queue ? 0u : static_cast<unsigned>(DBUS_NAME_FLAG_DO_NOT_QUEUE))) {
    case DBUS_REQUEST_NAME_REPLY_PRIMARY_OWNER:
    case DBUS_REQUEST_NAME_REPLY_ALREADY_OWNER:
        return Result::Owner;
    case DBUS_REQUEST_NAME_REPLY_IN_QUEUE:
        return Result::Queued;
    default:
        return Result::Taken;
    }
}

void BusName::release(const Bus& bus, const std::string& name) {
    mustBeValid(name);
    std::ignore = bus.blocking();
    bus.releaseName(name);
}

std::optional<std::string> BusName::owner(const Bus& bus, const std::string& name) {
    mustBeValid(name);
    try {
        const Message answer = bus.blocking().answerTo(aboutName("GetNameOwner", name), timeout);
        const char* owner = nullptr;
        dbus_message_get_args(answer.get(), nullptr, DBUS_TYPE_STRING, &owner, DBUS_TYPE_INVALID);
        return owner ? std::optional<std::string>(owner) : std::nullopt;
    } catch (const NotRunning&) {
        return std::nullopt;
    }
}

std::optional<int> BusName::processOf(const Bus& bus, const std::string& name) {
    mustBeValid(name);
    try {
        const Message answer = bus.blocking().answerTo(aboutName("GetConnectionUnixProcessID", name), timeout);
        dbus_uint32_t process = 0;
        dbus_message_get_args(answer.get(), nullptr, DBUS_TYPE_UINT32, &process, DBUS_TYPE_INVALID);
        return static_cast<int>(process);
    } catch (const NotRunning&) {
        return std::nullopt;
    }
}

std::vector<std::string> BusName::all(const Bus& bus) {
    const Message answer = bus.blocking().answerTo(BlockingConnection::callOfBus("ListNames"), timeout);
    DBusMessageIter list;
    DBusMessageIter entry;
    std::vector<std::string> names;
    if (!dbus_message_iter_init(answer.get(), &list) || dbus_message_iter_get_arg_type(&list) != DBUS_TYPE_ARRAY)
        return names;
    dbus_message_iter_recurse(&list, &entry);
    for (; dbus_message_iter_get_arg_type(&entry) == DBUS_TYPE_STRING; dbus_message_iter_next(&entry)) {
        const char* name = nullptr;
        dbus_message_iter_get_basic(&entry, &name);
        if (name[0] != ':')
            names.emplace_back(name);
    }
    std::sort(names.begin(), names.end());
    return names;
}

bool BusName::isValid(std::string_view name) {
    const std::string text(name);
    return text.find('\0') == std::string::npos && text.rfind(':', 0) != 0 &&
           dbus_validate_bus_name(text.c_str(), nullptr) != 0;
}

}  // namespace device
