#pragma once

#include <dbus/dbus.h>

#include <functional>
#include <memory>
#include <stdexcept>
#include <string>
#include <utility>
#include <vector>

namespace support {

/// A caller on a bus that sends whatever libdbus lets through: what a program of another kind may send.
class BusClient {
public:
    /// What is called: the owner of a name, its object, an interface of that.
    struct Target {
        std::string name;
        std::string path;
        std::string interface;
    };
    /// Appends an argument of a call.
    using Argument = std::function<void(DBusMessageIter* position)>;

    explicit BusClient(const std::string& address)
        : connection_(dbus_connection_open_private(address.c_str(), nullptr)) {
        if (!connection_ || !dbus_bus_register(connection_, nullptr))
            throw std::runtime_error(address + ": no bus");
        dbus_connection_set_exit_on_disconnect(connection_, FALSE);
    }
    ~BusClient() {
        dbus_connection_close(connection_);
        dbus_connection_unref(connection_);
    }
    BusClient(const BusClient&) = delete;
    BusClient& operator=(const BusClient&) = delete;

    /// Waits for the answer: "" for a good one, else the error's name and message, "name: message". Nobody is started
    /// for it unless `starts`.
    std::string call(const Target& target, const std::string& method, const std::vector<Argument>& arguments = {},
                     bool starts = false) {
        const Message message = make(target, method, arguments, starts);
        DBusError error;
        dbus_error_init(&error);
        const Message reply(dbus_connection_send_with_reply_and_block(connection_, message.get(), 30000, &error));
        const std::string what = reply ? "" : std::string(error.name) + ": " + error.message;
        dbus_error_free(&error);
        return what;
    }
    /// Comes back when the bus has it, and drops the answer.
    void send(const Target& target, const std::string& method, const std::vector<Argument>& arguments = {}) {
        const Message message = make(target, method, arguments, false);
        dbus_message_set_no_reply(message.get(), TRUE);
        dbus_connection_send(connection_, message.get(), nullptr);
        dbus_connection_flush(connection_);
    }

    static Argument text(std::string value) {
        return [value = std::move(value)](DBusMessageIter* position) { append(position, value); };
    }
    static Argument number(int value) {
        return
            [value](DBusMessageIter* position) { dbus_message_iter_append_basic(position, DBUS_TYPE_INT32, &value); };
    }
    /// a{ss}, in which a name may come twice.
    static Argument texts(std::vector<std::pair<std::string, std::string>> pairs) {
        return within("{ss}", [pairs = std::move(pairs)](DBusMessageIter* dictionary) {
            for (const auto& [key, value] : pairs) {
                DBusMessageIter entry;
                dbus_message_iter_open_container(dictionary, DBUS_TYPE_DICT_ENTRY, nullptr, &entry);
                append(&entry, key);
                append(&entry, value);
                dbus_message_iter_close_container(dictionary, &entry);
            }
        });
    }
    /// as
    static Argument list(std::vector<std::string> values) {
        return within("s", [values = std::move(values)](DBusMessageIter* array) {
            for (const std::string& value : values)
                append(array, value);
        });
    }
    /// An array with nothing in it, of elements of that type.
    static Argument nothing(const std::string& type) {
        return within(type, [](DBusMessageIter*) {});
    }

private:
    struct Release {
        void operator()(DBusMessage* message) const { dbus_message_unref(message); }
    };
    using Message = std::unique_ptr<DBusMessage, Release>;

    static void append(DBusMessageIter* position, const std::string& value) {
        const char* characters = value.c_str();
        dbus_message_iter_append_basic(position, DBUS_TYPE_STRING, &characters);
    }
    static Argument within(const std::string& type, Argument fill) {
        return [type, fill = std::move(fill)](DBusMessageIter* position) {
            DBusMessageIter array;
            dbus_message_iter_open_container(position, DBUS_TYPE_ARRAY, type.c_str(), &array);
            fill(&array);
            dbus_message_iter_close_container(position, &array);
        };
    }
    static Message make(const Target& target, const std::string& method, const std::vector<Argument>& arguments,
                        bool starts) {
        Message message(dbus_message_new_method_call(target.name.c_str(), target.path.c_str(), target.interface.c_str(),
                                                     method.c_str()));
        dbus_message_set_auto_start(message.get(), starts ? TRUE : FALSE);
        DBusMessageIter position;
        dbus_message_iter_init_append(message.get(), &position);
        for (const Argument& argument : arguments)
            argument(&position);
        return message;
    }

    DBusConnection* connection_;
};

}  // namespace support
