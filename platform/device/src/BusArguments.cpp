#include "device/BusArguments.h"

#include <dbus/dbus.h>

namespace device {
namespace {

/// The complete types of a signature; none where it is broken.
std::vector<std::string> typesOf(const std::string& signature) {
    std::vector<std::string> types;
    if (signature.empty() || !dbus_signature_validate(signature.c_str(), nullptr))
        return types;
    DBusSignatureIter position;
    dbus_signature_iter_init(&position, signature.c_str());
    do {
        char* type = dbus_signature_iter_get_signature(&position);
        types.emplace_back(type ? type : "");
        dbus_free(type);
    } while (dbus_signature_iter_next(&position));
    return types;
}

}  // namespace

std::string faultOfArguments(const std::vector<BusArgument>& taken, const std::string& signature) {
    const std::vector<std::string> given = typesOf(signature);
    for (std::size_t i = 0; i < taken.size(); ++i) {
        const std::string name = "the argument \"" + taken[i].name + '"';
        if (i >= given.size())
            return name + ", of the type " + taken[i].type + ", is missing";
        if (given[i] != taken[i].type)
            return name + " has the type " + given[i] + "; it must be " + taken[i].type;
    }
    if (given.size() <= taken.size())
        return "";
    return "the call has an argument too many, of the type " + given[taken.size()] +
           (taken.empty() ? "; the method takes none" : " behind \"" + taken.back().name + '"');
}

}  // namespace device
