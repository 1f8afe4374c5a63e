#pragma once

#include "device/Events.h"
#include "device/Log.h"
#include "device/Notifications.h"

#include <Ecore.h>
#include <Eldbus.h>

#include <chrono>
#include <cstdint>
#include <functional>
#include <string>

namespace device {
class Bus;
class Device;
}  // namespace device

/// A notification of the device as the desktop's own notification daemon shows it, until it is clicked, which sends
/// its launch request and takes it off the device, until it is closed, or until there is no daemon. Follows the
/// device's language meanwhile. What becomes of it stands in the device's log.
class DesktopNotification {
public:
    /// The device and the bus outlive it. `ended` is called from the main loop, once, when there is nothing more to
    /// wait for; it must not destroy this object. `answerTime`: how long the daemon may take for each answer.
    DesktopNotification(device::Device& device, device::Bus& bus, device::Notification notification,
                        std::function<void()> ended, std::chrono::milliseconds answerTime = std::chrono::seconds(10));
    ~DesktopNotification();
    DesktopNotification(const DesktopNotification&) = delete;
    DesktopNotification& operator=(const DesktopNotification&) = delete;

    /// Takes it off the desktop, where it shows or is about to, and ends. It stays on the device.
    void takeDown();

    /// Tells that the bus has gone: nothing is heard any more, and it ends.
    void busHasGone();

    /// Whether somebody on the bus shows notifications already. Throws device::Error when the bus does not answer.
    static bool hasDaemon(const device::Bus& bus);
    /// A line about that notification in the device's log.
    static void log(device::Device& device, device::Log::Level level, long long id, const std::string& line);

private:
    void send(Eldbus_Message* call, Eldbus_Message_Cb answered);
    void show();
    void follow();
    void open();
    void close();
    void end(device::Log::Level level, const std::string& line);
    void end();
    template <class Work>
    void guarded(Work&& work) noexcept;

    static void onCapabilities(void* self, const Eldbus_Message* answer, Eldbus_Pending*);
    static void onShown(void* self, const Eldbus_Message* answer, Eldbus_Pending*);
    static void onTakenDown(void* self, const Eldbus_Message* answer, Eldbus_Pending*);
    static void onAction(void* self, const Eldbus_Message* signal);
    static void onClosed(void* self, const Eldbus_Message* signal);
    static void onOwner(void* self, const char* name, const char* before, const char* now);
    static Eina_Bool onLook(void* self) noexcept;

    device::Device& device_;
    device::Bus& bus_;
    device::Notification notification_;
    std::function<void()> ended_;
    double answerMilliseconds_;
    Eldbus_Object* object_;
    Eldbus_Proxy* proxy_;
    // Several notifications of one process share the proxy, which may outlive this one.
    Eldbus_Signal_Handler* actions_;
    Eldbus_Signal_Handler* closings_;
    /// The answer that is still to come, one at a time.
    Eldbus_Pending* pending_ = nullptr;
    device::Events::Subscription language_;
    /// Looks, after the click, what has come of the launch.
    Ecore_Timer* looking_ = nullptr;
    int looks_ = 0;
    /// The daemon's own number; 0 before it has given one.
    std::uint32_t shown_ = 0;
    bool watchesOwner_ = false;
    bool takesMarkup_ = false;
    bool isAsking_ = false;  ///< the answer to Notify is still to come
    bool isStale_ = false;   ///< the language has changed since then
    bool isTakenDown_ = false;
    bool isOver_ = false;  ///< nothing counts that is heard from now on
};
