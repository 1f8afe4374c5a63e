#pragma once

#include <functional>
#include <memory>
#include <string>

namespace device {

class Bus;

struct PackageEvent {
    enum class Type { Install, Uninstall, Update };
    enum class State { Started, Processing, Completed, Failed };

    std::string id;
    Type type = Type::Install;
    State state = State::Started;
    int progress = 0;  ///< percent
    int error = 0;     ///< 0 unless state is Failed
};

/// Tells this process what changed on the device, whichever process changed it. It carries no values: who
/// is told reads the device. Everything happens on the main loop's thread.
class Events {
public:
    using SettingHandler = std::function<void(const std::string& key)>;
    using PackageHandler = std::function<void(const PackageEvent&)>;
    /// Ends its subscription when it is destroyed, also from inside the handler itself.
    using Subscription = std::shared_ptr<void>;

    Events();
    ~Events();
    Events(const Events&) = delete;
    Events& operator=(const Events&) = delete;

    [[nodiscard]] Subscription onSetting(SettingHandler handler);
    [[nodiscard]] Subscription onPackage(PackageHandler handler);

    /// Without a bus: calls this process's handlers at once, in the order in which they subscribed.
    /// With one: sends a signal that reaches every process of the device, this one included, from its main loop. A
    /// key that the bus cannot carry (not UTF-8, or longer than 64 KiB) reaches this process's handlers only.
    void publishSetting(const std::string& key);
    void publishPackage(const PackageEvent& event);

    /// From now on events travel over the bus. Ends when the bus is destroyed.
    void connect(Bus& bus);
    void disconnect();

private:
    struct State;
    std::shared_ptr<State> state_;
};

}  // namespace device
