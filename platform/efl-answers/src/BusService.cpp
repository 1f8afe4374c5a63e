#include "Original.h"

#include <device/BusArguments.h>

#include <Eldbus.h>

#include <exception>
#include <map>
#include <string>
#include <string_view>
#include <utility>
#include <vector>

namespace {

using Method = std::pair<std::string, std::string>;  // interface, name

std::map<Method, std::vector<device::BusArgument>>& known() {
    static std::map<Method, std::vector<device::BusArgument>> methods;
    return methods;
}

std::string stringOf(const char* text) {
    return text ? text : "";
}

void remember(const Eldbus_Service_Interface_Desc& description) {
    for (const Eldbus_Method* method = description.methods; method && method->member; ++method) {
        std::vector<device::BusArgument> arguments;
        for (const Eldbus_Arg_Info* argument = method->in; argument && argument->signature; ++argument)
            arguments.push_back({stringOf(argument->name), argument->signature});
        known().insert_or_assign({stringOf(description.interface), method->member}, std::move(arguments));
    }
}

/// As "Launch: the argument "extras" has the type s; it must be a{ss}"; "" for a method that nobody here offers.
std::string faultOf(const Eldbus_Message* call) {
    const std::string name = stringOf(eldbus_message_member_get(call));
    const auto method = known().find({stringOf(eldbus_message_interface_get(call)), name});
    if (method == known().end())
        return "";
    return name + ": " + device::faultOfArguments(method->second, stringOf(eldbus_message_signature_get(call)));
}

}  // namespace

/// Its descriptions are kept, for the answer below.
extern "C" Eldbus_Service_Interface* eldbus_service_interface_register(Eldbus_Connection* connection, const char* path,
                                                                       const Eldbus_Service_Interface_Desc* desc) {
    static const auto add = efl_answers::original<Eldbus_Service_Interface*(
        Eldbus_Connection*, const char*, const Eldbus_Service_Interface_Desc*)>("eldbus_service_interface_register");
    if (!add || !desc)
        return nullptr;
    try {
        remember(*desc);
    } catch (const std::exception&) {
        // Without it, EFL's own words have to do.
        known().clear();
    }
    return add(connection, path, desc);
}

/// EFL answers a call with other arguments than the method takes by itself, and only refers to the description of the
/// object. Who called is told which argument is wrong, and why.
extern "C" Eldbus_Message* eldbus_message_error_new(const Eldbus_Message* call, const char* name, const char* text) {
    static const auto make = efl_answers::original<Eldbus_Message*(const Eldbus_Message*, const char*, const char*)>(
        "eldbus_message_error_new");
    if (!make)
        return nullptr;
    try {
        if (call && std::string_view("org.freedesktop.DBus.Error.InvalidSignature") == stringOf(name))
            if (const std::string fault = faultOf(call); !fault.empty())
                return make(call, name, fault.c_str());
    } catch (const std::exception&) {
        return make(call, name, text);
    }
    return make(call, name, text);
}
