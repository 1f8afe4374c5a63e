#include "device/BusName.h"

#include "BlockingConnection.h"
#include "device/Bus.h"
#include "device/Error.h"
#include "device/OneLine.h"

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

bool isDigit(char character) {
    return character >= '0' && character <= '9';
}

bool isAllowed(char character) {
    return isDigit(character) || (character >= 'a' && character <= 'z') || (character >= 'A' && character <= 'Z') ||
           character == '-' || character == '_';
}

/// The whole character of UTF-8 that begins there, as people are told of it.
std::string characterAt(std::string_view text, std::size_t begin) {
    std::size_t end = begin + 1;
    while (end < text.size() && (static_cast<unsigned char>(text[end]) & 0xC0) == 0x80)
        ++end;
    const auto byte = static_cast<unsigned char>(text[begin]);
    const bool isControl = byte < ' ' || byte == 0x7f;
    return isControl ? "a control character" : '"' + std::string(text.substr(begin, end - begin)) + '"';
}

std::string faultOfPart(std::string_view part, std::size_t number) {
    const std::string which = "part " + std::to_string(number) + " of it";
    if (part.empty())
        return which + " is empty";
    const std::string shown = which + ", \"" + oneLine(std::string(part), part.size()) + "\",";
    if (isDigit(part.front()))
        return shown + " begins with a digit";
    const auto wrong = std::find_if_not(part.begin(), part.end(), isAllowed);
    if (wrong == part.end())
        return "";
    return shown + " holds " + characterAt(part, static_cast<std::size_t>(wrong - part.begin())) +
           "; only letters, digits, \"-\" and \"_\" may stand there";
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

std::string BusName::faultOf(std::string_view name) {
    if (isValid(name))
        return "";
    if (name.empty())
        return "it is empty";
    if (name.size() > DBUS_MAXIMUM_NAME_LENGTH)
        return "it is longer than 255 characters";
    std::size_t number = 0;
    for (std::size_t begin = 0; begin <= name.size(); ++number) {
        const std::size_t end = std::min(name.find('.', begin), name.size());
        if (std::string fault = faultOfPart(name.substr(begin, end - begin), number + 1); !fault.empty())
            return fault;
        begin = end + 1;
    }
    return number < 2 ? "it has no dot; it needs two or more parts, joined by dots" : "the bus does not take it";
}

}  // namespace device
