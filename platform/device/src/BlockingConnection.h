#pragma once

#include "device/Error.h"

#include <chrono>
#include <dbus/dbus.h>
#include <memory>
#include <string>

namespace device {

struct MessageRelease {
    void operator()(DBusMessage* message) const { dbus_message_unref(message); }
};
using Message = std::unique_ptr<DBusMessage, MessageRelease>;

/// Nobody owns the name that was asked.
class NotRunning : public Error {
public:
    using Error::Error;
};

/// A D-Bus connection that waits for its answers. Eldbus has such a call too, but it drops the error that comes back.
class BlockingConnection {
public:
    /// Throws Error when the bus does not answer.
    explicit BlockingConnection(const std::string& address);
    ~BlockingConnection();
    BlockingConnection(const BlockingConnection&) = delete;
    BlockingConnection& operator=(const BlockingConnection&) = delete;

    /// Sends a method call and returns the answer.
    /// Throws Error: the message of the error that came back, or that nobody answered (NotRunning when there is
    /// nobody).
    Message answerTo(const Message& call, std::chrono::milliseconds timeout);

    /// A call of a method of the bus itself.
    static Message callOfBus(const char* method);

private:
    DBusConnection* connection_;
};

}  // namespace device
