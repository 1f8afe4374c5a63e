#pragma once

#include <chrono>
#include <string>
#include <utility>
#include <variant>
#include <vector>

namespace device {

class Bus;

/// Calls the methods of one object on the device's bus and waits for the answers, without a main loop.
/// Nothing else is dispatched meanwhile, so an object of this process must not be called this way.
/// All calls throw Error: with the message of the D-Bus error that came back; "<destination> is not running";
/// "<destination> did not answer within <seconds> s"; "<destination> ended before it answered"; or what is wrong with
/// an argument (a text that is not UTF-8).
class BusCall {
public:
    using Texts = std::vector<std::pair<std::string, std::string>>;
    using Argument = std::variant<std::string, int, double, bool, Texts>;  ///< D-Bus types s, i, d, b, a{ss}
    using Arguments = std::vector<Argument>;

    /// For example {bus, "com.example.app", bus::pathOf("com.example.app"), bus::screenInterface}.
    BusCall(const Bus& bus, std::string destination, std::string path, std::string interface,
            std::chrono::milliseconds timeout = std::chrono::seconds(10));

    /// Calls a method and drops what it returns.
    void call(const std::string& method, const Arguments& arguments = {}) const;
    /// Calls a method that returns one string.
    std::string text(const std::string& method, const Arguments& arguments = {}) const;
    /// Calls a method that returns one boolean.
    bool truth(const std::string& method, const Arguments& arguments = {}) const;
    /// Reads a string property of the interface.
    std::string property(const std::string& name) const;

private:
    const Bus& bus_;
    std::string destination_;
    std::string path_;
    std::string interface_;
    std::chrono::milliseconds timeout_;
};

}  // namespace device
