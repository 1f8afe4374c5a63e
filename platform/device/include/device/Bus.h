#pragma once

#include "device/Folder.h"

#include <Eldbus.h>

#include <functional>
#include <memory>
#include <string>

namespace device {

class BlockingConnection;

/// Names on the bus that every process of a device knows.
namespace bus {
/// Owned by the device's first process, queued for by the others.
inline constexpr char deviceName[] = "com.ravella.device";
inline constexpr char eventsPath[] = "/com/ravella/device";  ///< signals of Events come from here
inline constexpr char eventsInterface[] = "com.ravella.device.Events";
inline constexpr char applicationInterface[] = "com.ravella.device.Application";
inline constexpr char screenInterface[] = "com.ravella.device.Screen";
/// The object path of an application: "com.example.app" gives "/com/example/app" ('-' becomes '_').
std::string pathOf(const std::string& appId);
}  // namespace bus

/// This process's connection to the device's bus: the private one that the device's folder names, where it runs, else
/// the session bus. Owns the connection; ends it when destroyed.
class Bus {
    struct Link;

public:
    /// Null when there is no bus on a local socket, or none that answers within 2 s (never an abort, never a hang,
    /// nothing on standard error).
    static std::unique_ptr<Bus> connect(const Folder& folder);
    explicit Bus(std::unique_ptr<Link> link);  ///< for connect() only
    ~Bus();
    Bus(const Bus&) = delete;
    Bus& operator=(const Bus&) = delete;

    /// For what is served and sent; its answers come through the main loop.
    Eldbus_Connection* connection() const;
    const Folder& folder() const;

    /// Where its daemon listens.
    const std::string& address() const;

    /// Whether it is the device's private bus, not the session bus.
    bool isPrivate() const;

    /// False once the bus has gone. Nothing that waits for an answer may be sent on connection() then: libdbus
    /// ends a process that does.
    bool isAlive() const;

    /// Called from the main loop when the bus goes away while the process runs; may destroy this object.
    void onLost(std::function<void()> handler);

    /// Has the main loop wait, at its next turn, until the bus has taken all that was sent on connection(). To be
    /// called by whoever sends a message or an answer of more than 64 KiB: Eldbus forgets the rest of a message that
    /// the socket does not take at once, until it sends the next one.
    void flushSoon() const;

    /// A second connection, for calls that wait for their answer without a main loop; opened at the first call.
    /// All that was sent on connection() before has reached the bus when this returns. For BusName and BusCall.
    /// Throws Error when the bus does not answer.
    BlockingConnection& blocking() const;

    /// Has the bus take a name for connection(), or give it back. For BusName.
    unsigned requestName(const std::string& name, unsigned flags) const;
    void releaseName(const std::string& name) const;

private:
    std::unique_ptr<Link> link_;
};

}  // namespace device
