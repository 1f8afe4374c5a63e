#include "device/BusCall.h"

#include "BlockingConnection.h"
#include "Utf8.h"
#include "device/Bus.h"
#include "device/Error.h"

#include <new>
#include <utility>

namespace device {
namespace {

/// libdbus ends the process that names what cannot be named.
Message newCall(const std::string& destination, const std::string& path, const std::string& interface,
                const std::string& method) {
    if (!dbus_validate_bus_name(destination.c_str(), nullptr))
        throw Error("\"" + destination + "\" is no name of an application");
    if (!dbus_validate_path(path.c_str(), nullptr) || !dbus_validate_interface(interface.c_str(), nullptr) ||
        !dbus_validate_member(method.c_str(), nullptr))
        throw Error(destination + ": cannot be asked for \"" + interface + "." + method + "\" at \"" + path + "\"");
    Message call(dbus_message_new_method_call(destination.c_str(), path.c_str(), interface.c_str(), method.c_str()));
    if (!call)
        throw std::bad_alloc();
    // Whoever asks an application that runs does not mean to start one that has just ended.
    dbus_message_set_auto_start(call.get(), FALSE);
    return call;
}

/// A container that is being filled; one that is not closed, since what was to go into it is refused, is let go.
class Container {
public:
    Container(DBusMessageIter* outer, int type, const char* signature) : outer_(outer) {
        if (!dbus_message_iter_open_container(outer_, type, signature, &inner_))
            throw std::bad_alloc();
    }
    ~Container() {
        if (outer_)
            dbus_message_iter_abandon_container(outer_, &inner_);
    }
    Container(const Container&) = delete;
    Container& operator=(const Container&) = delete;

    DBusMessageIter* inside() { return &inner_; }
    void close() {
        // Whatever comes of it, libdbus has let go of it.
        if (!dbus_message_iter_close_container(std::exchange(outer_, nullptr), &inner_))
            throw std::bad_alloc();
    }

private:
    DBusMessageIter* outer_;
    DBusMessageIter inner_{};
};

struct Appender {
    DBusMessageIter* arguments;

    void operator()(const std::string& text) const {
        if (!isUtf8(text))
            throw Error("a text is not UTF-8; give one that is");
        const char* characters = text.c_str();
        append(DBUS_TYPE_STRING, &characters);
    }
    void operator()(int number) const {
        const dbus_int32_t value = number;
        append(DBUS_TYPE_INT32, &value);
    }
    void operator()(double number) const { append(DBUS_TYPE_DOUBLE, &number); }
    void operator()(bool truth) const {
        const dbus_bool_t value = truth ? TRUE : FALSE;
        append(DBUS_TYPE_BOOLEAN, &value);
    }
    void operator()(const BusCall::Texts& texts) const {
        Container dictionary(arguments, DBUS_TYPE_ARRAY, "{ss}");
        for (const auto& [key, value] : texts) {
            Container entry(dictionary.inside(), DBUS_TYPE_DICT_ENTRY, nullptr);
            Appender{entry.inside()}(key);
            Appender{entry.inside()}(value);
            entry.close();
        }
        dictionary.close();
    }
    void append(int type, const void* value) const {
        if (!dbus_message_iter_append_basic(arguments, type, value))
            throw std::bad_alloc();
    }
};

Message answerOf(const Bus& bus, const Message& call, const BusCall::Arguments& arguments,
                 std::chrono::milliseconds timeout) {
    DBusMessageIter position;
    dbus_message_iter_init_append(call.get(), &position);
    for (const BusCall::Argument& argument : arguments)
        std::visit(Appender{&position}, argument);
    return bus.blocking().answerTo(call, timeout);
}

/// Moves to the value of the wanted type, into a variant if it stands in one.
void expect(DBusMessageIter& position, int type, const Message& answer, const std::string& what) {
    bool found = dbus_message_iter_init(answer.get(), &position);
    if (found && dbus_message_iter_get_arg_type(&position) == DBUS_TYPE_VARIANT) {
        DBusMessageIter inner;
        dbus_message_iter_recurse(&position, &inner);
        position = inner;
    }
    if (!found || dbus_message_iter_get_arg_type(&position) != type)
        throw Error(what + " answered with something else than was asked for; both must be of one version");
}

std::string textOf(const Message& answer, const std::string& what) {
    DBusMessageIter position;
    expect(position, DBUS_TYPE_STRING, answer, what);
    const char* text = nullptr;
    dbus_message_iter_get_basic(&position, &text);
    return text;
}

}  // namespace

BusCall::BusCall(const Bus& bus, std::string destination, std::string path, std::string interface,
                 std::chrono::milliseconds timeout)
    : bus_(bus), destination_(std::move(destination)), path_(std::move(path)), interface_(std::move(interface)),
      timeout_(timeout) {}

void BusCall::call(const std::string& method, const Arguments& arguments) const {
    answerOf(bus_, newCall(destination_, path_, interface_, method), arguments, timeout_);
}

std::string BusCall::text(const std::string& method, const Arguments& arguments) const {
    const Message call = newCall(destination_, path_, interface_, method);
    return textOf(answerOf(bus_, call, arguments, timeout_), destination_);
}

bool BusCall::truth(const std::string& method, const Arguments& arguments) const {
    const Message call = newCall(destination_, path_, interface_, method);
    const Message answer = answerOf(bus_, call, arguments, timeout_);
    DBusMessageIter position;
    expect(position, DBUS_TYPE_BOOLEAN, answer, destination_);
    dbus_bool_t truth = FALSE;
    dbus_message_iter_get_basic(&position, &truth);
    return truth != FALSE;
}

std::string BusCall::property(const std::string& name) const {
    const Message call = newCall(destination_, path_, DBUS_INTERFACE_PROPERTIES, "Get");
    return textOf(answerOf(bus_, call, {interface_, name}, timeout_), destination_);
}

}  // namespace device
