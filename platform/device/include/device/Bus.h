#pragma once

#include <Eldbus.h>

#include <functional>
#include <memory>
#include <string>

namespace device {

class Folder;

/// Names on the bus that every process of a device knows.
namespace bus {
inline constexpr char deviceName[] =
    "com.ravella.device";  ///< owned by the device's first process, queued for by the others
inline constexpr char eventsPath[] = "/com/ravella/device";  ///< signals of Events come from here
inline constexpr char eventsInterface[] = "com.ravella.device.Events";
inline constexpr char applicationInterface[] = "com.ravella.device.Application";
inline constexpr char screenInterface[] = "com.ravella.device.Screen";
/// The object path of an application: "com.example.app" gives "/com/example/app" ('-' becomes '_').
std::string pathOf(const std::string& appId);
}  // namespace bus

/// This process's connection to the device's bus: the session bus where there is one, else the private bus that
/// the device's folder names. Owns the connection; ends it when destroyed.
class Bus {
public:
    /// Null when there is no bus at all, or none that answers (never an abort, never a hang).
    static std::unique_ptr<Bus> connect(const Folder& folder);
    ~Bus();
    Bus(const Bus&) = delete;
    Bus& operator=(const Bus&) = delete;

    Eldbus_Connection* connection() const { return connection_; }
    const Folder& folder() const { return folder_; }

    /// Called when the bus goes away while the process runs.
    void onLost(std::function<void()> handler);

private:
    Bus(Eldbus_Connection* connection, const Folder& folder);
    Eldbus_Connection* connection_;
    const Folder& folder_;
    std::function<void()> lost_;
};

}  // namespace device
