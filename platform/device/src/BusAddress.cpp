#include "BusAddress.h"

#include "Files.h"
#include "device/Folder.h"

#include <cerrno>
#include <chrono>
#include <cstddef>
#include <cstdlib>
#include <cstring>
#include <dbus/dbus.h>
#include <fstream>
#include <memory>
#include <poll.h>
#include <string_view>
#include <sys/socket.h>
#include <sys/un.h>
#include <unistd.h>

namespace device {
namespace {

constexpr std::chrono::milliseconds patience{2000};
constexpr std::size_t longestAnswer = 1024;

using Entries = std::unique_ptr<DBusAddressEntry*, decltype(&dbus_address_entries_free)>;

struct Address {
    Entries entries{nullptr, &dbus_address_entries_free};
    int count = 0;
};

Address parsed(const std::string& text) {
    DBusAddressEntry** entries = nullptr;
    Address address;
    DBusError error = DBUS_ERROR_INIT;
    if (dbus_parse_address(text.c_str(), &entries, &address.count, &error))
        address.entries.reset(entries);
    dbus_error_free(&error);
    return address;
}

/// The socket's name as connect(2) takes it; an abstract one begins with a zero byte.
std::string socketName(DBusAddressEntry* entry) {
    if (std::string_view(dbus_address_entry_get_method(entry)) != "unix")
        return "";
    if (const char* path = dbus_address_entry_get_value(entry, "path"))
        return path;
    if (const char* abstract = dbus_address_entry_get_value(entry, "abstract"))
        return std::string(1, '\0') + abstract;
    return "";
}

/// A connection to the socket, without waiting for one whose queue is full.
Descriptor connectedTo(const std::string& name) {
    sockaddr_un address{};
    if (name.empty() || name.size() >= sizeof address.sun_path)
        return Descriptor();
    address.sun_family = AF_UNIX;
    std::memcpy(address.sun_path, name.data(), name.size());
    const bool abstract = name.front() == '\0';
    const auto length = static_cast<socklen_t>(offsetof(sockaddr_un, sun_path) + name.size() + (abstract ? 0 : 1));
    Descriptor socket(::socket(AF_UNIX, SOCK_STREAM | SOCK_CLOEXEC | SOCK_NONBLOCK, 0));
    if (!socket || ::connect(socket.get(), reinterpret_cast<const sockaddr*>(&address), length) != 0)
        return Descriptor();
    return socket;
}

/// The first word of D-Bus authentication: this process's user, in hexadecimal digits of its decimal digits.
std::string greeting() {
    constexpr char digits[] = "0123456789abcdef";
    std::string line("\0AUTH EXTERNAL ", 15);
    for (const char digit : std::to_string(getuid())) {
        line += digits[static_cast<unsigned char>(digit) >> 4];
        line += digits[static_cast<unsigned char>(digit) & 0xf];
    }
    return line + "\r\n";
}

/// The bus's answer to the greeting, without its end; empty when none comes in time.
std::string answerToGreeting(const Descriptor& socket) {
    const std::string line = greeting();
    std::string answer;
    if (send(socket.get(), line.data(), line.size(), MSG_NOSIGNAL) != static_cast<ssize_t>(line.size()))
        return answer;
    const auto end = std::chrono::steady_clock::now() + patience;
    while (answer.size() < longestAnswer && !answer.ends_with("\r\n")) {
        const auto left =
            std::chrono::duration_cast<std::chrono::milliseconds>(end - std::chrono::steady_clock::now()).count();
        pollfd wait{socket.get(), POLLIN, 0};
        const int ready = poll(&wait, 1, left > 0 ? static_cast<int>(left) : 0);
        if (ready < 0 && errno == EINTR)
            continue;
        char byte = 0;
        if (ready != 1 || recv(socket.get(), &byte, 1, 0) != 1)
            return {};
        answer += byte;
    }
    return answer;
}

/// Whether the bus of the address is there: one that refuses this user, or another bus in its place, is not.
bool isThere(DBusAddressEntry* entry) {
    const Descriptor socket = connectedTo(socketName(entry));
    const std::string answer = socket ? answerToGreeting(socket) : "";
    const char* id = dbus_address_entry_get_value(entry, "guid");
    return id ? answer == "OK " + std::string(id) + "\r\n" : answer.starts_with("OK ");
}

}  // namespace

std::vector<BusAddress> busAddresses(const Folder& folder) {
    std::vector<BusAddress> addresses;
    std::error_code error;
    if (std::filesystem::is_regular_file(folder.busAddress(), error)) {
        std::ifstream file(folder.busAddress());
        std::string line;
        std::getline(file, line);
        addresses.push_back({line, true});
    }
    if (const char* session = std::getenv("DBUS_SESSION_BUS_ADDRESS"))
        addresses.push_back({session, false});
    return addresses;
}

bool answers(const std::string& text) {
    const Address address = parsed(text);
    for (int entry = 0; entry < address.count; ++entry) {
        if (isThere(address.entries.get()[entry]))
            return true;
    }
    return false;
}

}  // namespace device
