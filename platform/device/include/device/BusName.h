#pragma once

#include <optional>
#include <string>
#include <string_view>
#include <vector>

namespace device {

class Bus;

/// Well-known names on the device's bus: who owns them, and owning them. Each call waits for the bus's answer.
/// All throw Error when the bus does not answer or when the name is none that a bus knows (isValid()).
class BusName {
public:
    enum class Result {
        Owner,   ///< this process owns the name now (or owned it already)
        Queued,  ///< somebody else owns it; this process gets it after those who asked before
        Taken,   ///< somebody else owns it, and this process does not wait for it
    };

    /// Asks for a name; nobody takes it from its owner. `queue`: wait in line when it is owned.
    /// The name is given back by release() or by the end of the connection.
    static Result own(const Bus& bus, const std::string& name, bool queue);
    static void release(const Bus& bus, const std::string& name);

    /// The unique name (":1.7") of the owner; nullopt when nobody owns the name.
    static std::optional<std::string> owner(const Bus& bus, const std::string& name);
    /// The process of the owner; nullopt when nobody owns the name.
    static std::optional<int> processOf(const Bus& bus, const std::string& name);
    /// The well-known names that somebody owns, in alphabetical order.
    static std::vector<std::string> all(const Bus& bus);

    /// Whether the text can be a well-known name: two or more elements, joined by dots, of letters, digits, '-'
    /// and '_', none of which begins with a digit; at most 255 characters.
    static bool isValid(std::string_view name);
    /// Why it cannot, and which part of it is wrong, as "part 2 of it is empty"; "" when it can.
    static std::string faultOf(std::string_view name);
};

}  // namespace device
