#include "BlockingConnection.h"

#include <new>
#include <string_view>

namespace device {
namespace {

/// An error that libdbus fills in, freed with it.
class Failure {
public:
    Failure() { dbus_error_init(&error_); }
    ~Failure() { dbus_error_free(&error_); }
    Failure(const Failure&) = delete;
    Failure& operator=(const Failure&) = delete;
    DBusError* get() { return &error_; }
    std::string_view name() const { return error_.name ? error_.name : ""; }
    std::string message() const { return error_.message ? error_.message : "no reason given"; }

private:
    DBusError error_;
};

std::string secondsOf(std::chrono::milliseconds time) {
    std::string text = std::to_string(static_cast<double>(time.count()) / 1000);
    text.erase(text.find_last_not_of('0') + 1);
    if (text.back() == '.')
        text.pop_back();
    return text;
}

constexpr char busHasGone[] = "the device's bus has gone; start the device anew";

[[noreturn]] void fail(const Failure& failure, const std::string& destination, bool inTime,
                       std::chrono::milliseconds timeout) {
    if (failure.name() == DBUS_ERROR_SERVICE_UNKNOWN || failure.name() == DBUS_ERROR_NAME_HAS_NO_OWNER)
        throw NotRunning(destination + " is not running");
    if (failure.name() == DBUS_ERROR_NO_REPLY && inTime)
        throw Error(destination + " ended before it answered");
    if (failure.name() == DBUS_ERROR_NO_REPLY || failure.name() == DBUS_ERROR_TIMEOUT)
        throw Error(destination + " did not answer within " + secondsOf(timeout) + " s");
    throw Error(failure.message());
}

}  // namespace

BlockingConnection::BlockingConnection(const std::string& address) {
    Failure failure;
    connection_ = dbus_connection_open_private(address.c_str(), failure.get());
    if (!connection_)
        throw Error("the device's bus does not answer at " + address + ": " + failure.message());
    dbus_connection_set_exit_on_disconnect(connection_, FALSE);
    if (!dbus_bus_register(connection_, failure.get())) {
        dbus_connection_close(connection_);
        dbus_connection_unref(connection_);
        throw Error("the device's bus does not answer at " + address + ": " + failure.message());
    }
}

BlockingConnection::~BlockingConnection() {
    dbus_connection_close(connection_);
    dbus_connection_unref(connection_);
}

Message BlockingConnection::answerTo(const Message& call, std::chrono::milliseconds timeout) {
    Failure failure;
    const auto begin = std::chrono::steady_clock::now();
    Message answer(dbus_connection_send_with_reply_and_block(connection_, call.get(), static_cast<int>(timeout.count()),
                                                             failure.get()));
    // Signals to this connection are nobody's business; unread they would pile up.
    while (Message unasked{dbus_connection_pop_message(connection_)}) {
    }
    if (!answer && !dbus_connection_get_is_connected(connection_))
        throw Error(busHasGone);
    if (!answer)
        fail(failure, dbus_message_get_destination(call.get()), std::chrono::steady_clock::now() - begin < timeout,
             timeout);
    return answer;
}

Message BlockingConnection::callOfBus(const char* method) {
    Message call(dbus_message_new_method_call(DBUS_SERVICE_DBUS, DBUS_PATH_DBUS, DBUS_INTERFACE_DBUS, method));
    if (!call)
        throw std::bad_alloc();
    return call;
}

}  // namespace device
