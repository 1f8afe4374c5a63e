#pragma once

#include <string>
#include <vector>

namespace device {

/// An argument of a method on the bus.
struct BusArgument {
    std::string name;
    std::string type;  ///< one complete type, as "a{ss}"
};

/// How the arguments of a call, by their signature, are not those that the method takes; "" when they are.
std::string faultOfArguments(const std::vector<BusArgument>& taken, const std::string& signature);

}  // namespace device
