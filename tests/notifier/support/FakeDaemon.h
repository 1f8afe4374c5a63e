#pragma once

#include "device/Bus.h"

#include <Eldbus.h>

#include <cstdint>
#include <functional>
#include <memory>
#include <string>
#include <vector>

namespace support {

/// A desktop's notification daemon on the session bus of this process, which shows nothing and remembers all. Answers
/// from this process's main loop.
class FakeDaemon {
public:
    static constexpr char name[] = "org.freedesktop.Notifications";

    /// One call of Notify.
    struct Call {
        std::string application;
        std::uint32_t replaces = 0;
        std::string icon;
        std::string title;
        std::string text;
        std::vector<std::string> actions;
        std::string desktopEntry;
        int milliseconds = 0;
    };

    explicit FakeDaemon(const device::Folder& folder, std::vector<std::string> capabilities = {"body", "actions"});
    ~FakeDaemon();
    FakeDaemon(const FakeDaemon&) = delete;
    FakeDaemon& operator=(const FakeDaemon&) = delete;

    /// What was asked for, and which numbers were to be closed.
    const std::vector<Call>& calls() const { return calls_; }
    const std::vector<std::uint32_t>& closed() const { return closed_; }

    /// What a person, or time, does to it.
    void invoke(std::uint32_t number, const std::string& action = "default") const;
    void close(std::uint32_t number, std::uint32_t reason) const;

    /// From now on it takes calls of that method and never answers.
    void ignore(const std::string& method) { ignored_ = method; }
    /// The number of the next notification that replaces none.
    void countFrom(std::uint32_t number) { next_ = number; }
    /// Called when Notify has come, before the answer goes.
    void onNotify(std::function<void()> handler) { notified_ = std::move(handler); }

private:
    Eldbus_Message* answer(const Eldbus_Message* call, const char* method,
                           const std::function<void(Eldbus_Message*)>& fill);
    static FakeDaemon& of(const Eldbus_Service_Interface* interface);
    static Eldbus_Message* onCapabilities(const Eldbus_Service_Interface* interface, const Eldbus_Message* call);
    static Eldbus_Message* onNotifyCall(const Eldbus_Service_Interface* interface, const Eldbus_Message* call);
    static Eldbus_Message* onClose(const Eldbus_Service_Interface* interface, const Eldbus_Message* call);

    std::unique_ptr<device::Bus> bus_;
    std::vector<std::string> capabilities_;
    Eldbus_Service_Interface* interface_ = nullptr;
    std::vector<Call> calls_;
    std::vector<std::uint32_t> closed_;
    std::string ignored_;
    std::function<void()> notified_;
    std::uint32_t next_ = 1;
};

}  // namespace support
