#include "PrivateBus.h"

#include "device/Error.h"

#include <algorithm>
#include <array>
#include <cerrno>
#include <cstdlib>
#include <cstring>
#include <fcntl.h>
#include <fstream>
#include <poll.h>
#include <string>
#include <string_view>
#include <sys/un.h>
#include <unistd.h>

namespace tool {

namespace {

namespace fs = std::filesystem;

constexpr int startMilliseconds = 10000;
constexpr std::string_view shortFolderName = "device-bus-";

/// The path as a bus address writes it.
std::string escaped(const fs::path& path) {
    static constexpr char hex[] = "0123456789abcdef";
    std::string text;
    for (const char character : path.string()) {
        const auto byte = static_cast<unsigned char>(character);
        if (std::isalnum(byte) || std::string_view("-_/.\\*").find(character) != std::string_view::npos) {
            text += character;
        } else {
            text += {'%', hex[byte >> 4], hex[byte & 15]};
        }
    }
    return text;
}

fs::path daemonProgram() {
    const char* path = std::getenv("PATH");
    std::string folders = std::string(path ? path : "") + ":/usr/bin:/bin";
    for (std::size_t begin = 0; begin < folders.size();) {
        const std::size_t end = std::min(folders.find(':', begin), folders.size());
        fs::path program = fs::path(folders.substr(begin, end - begin)) / "dbus-daemon";
        if (program.is_absolute() && access(program.c_str(), X_OK) == 0) {
            return program;
        }
        begin = end + 1;
    }
    throw device::Error("dbus-daemon is missing, which the device needs for its bus; install the package dbus-daemon");
}

void writeWhole(const fs::path& file, const std::string& text) {
    const fs::path draft = file.string() + ".new";
    std::ofstream stream(draft);
    stream << text << std::flush;
    std::error_code error;
    if (stream) {
        fs::rename(draft, file, error);
    }
    if (!stream || error) {
        fs::remove(draft, error);
        throw device::Error("cannot write " + file.string() + "; is the disk full?");
    }
}

/// Both ends of a pipe, closed at the end.
class Pipe {
public:
    Pipe() {
        if (pipe2(ends_.data(), O_CLOEXEC) != 0) {
            throw device::Error(std::string("cannot make a pipe: ") + std::strerror(errno));
        }
    }
    ~Pipe() {
        closeWriting();
        close(ends_[0]);
    }
    Pipe(const Pipe&) = delete;
    Pipe& operator=(const Pipe&) = delete;

    int writing() const { return ends_[1]; }
    void closeWriting() {
        if (ends_[1] >= 0) {
            close(ends_[1]);
            ends_[1] = -1;
        }
    }

    /// The first line that is written, without its end; empty when none comes.
    std::string readLine() const {
        std::string line;
        pollfd readable{ends_[0], POLLIN, 0};
        char character = 0;
        while (poll(&readable, 1, startMilliseconds) > 0 && read(ends_[0], &character, 1) == 1 && character != '\n') {
            line += character;
        }
        return line;
    }

private:
    std::array<int, 2> ends_{-1, -1};
};

}  // namespace

std::optional<device::Process> PrivateBus::process() const {
    std::ifstream stream(folder_.busProcess());
    int id = 0;
    if (!(stream >> id) || id <= 1) {
        return std::nullopt;
    }
    // After a crash or a reboot the number may be somebody else's.
    const device::Process daemon(id);
    const std::vector<std::string> words = daemon.arguments();
    const bool ours =
        std::find(words.begin(), words.end(), "--address=unix:path=" + escaped(recordedSocket())) != words.end();
    return ours && daemon.runs() ? std::optional(daemon) : std::nullopt;
}

fs::path PrivateBus::recordedSocket() const {
    std::ifstream stream(folder_.busAddress());
    std::string address;
    std::getline(stream, address);
    static constexpr std::string_view prefix = "unix:path=";
    if (!address.starts_with(prefix)) {
        return folder_.busSocket();
    }
    const std::string path = address.substr(prefix.size(), address.find(',') - prefix.size());
    return path == escaped(folder_.busSocket()) ? folder_.busSocket() : fs::path(path);
}

/// The folder's own place, or one in a short folder when a socket's name cannot be that long.
fs::path PrivateBus::chooseSocket() const {
    if (folder_.busSocket().string().size() < sizeof(sockaddr_un::sun_path)) {
        return folder_.busSocket();
    }
    std::string name = fs::temp_directory_path() / (std::string(shortFolderName) + "XXXXXX");
    if (!mkdtemp(name.data())) {
        throw device::Error("cannot make the folder " + name + " for the device's bus: " + std::strerror(errno));
    }
    return fs::path(name) / "bus";
}

void PrivateBus::removeFiles() const {
    std::error_code ignored;
    const fs::path socket = recordedSocket();
    fs::remove(socket, ignored);
    if (socket.parent_path().filename().string().starts_with(shortFolderName)) {
        fs::remove(socket.parent_path(), ignored);
    }
    fs::remove(folder_.busAddress(), ignored);
    fs::remove(folder_.busProcess(), ignored);
}

void PrivateBus::start() const {
    stop();
    const fs::path program = daemonProgram();
    const fs::path socket = chooseSocket();
    writeWhole(folder_.busAddress(), "unix:path=" + escaped(socket) + "\n");
    Pipe addresses;
    device::Program daemon;
    daemon.words = {program,
                    "--session",
                    "--nofork",
                    "--nopidfile",
                    "--nosyslog",
                    "--address=unix:path=" + escaped(socket),
                    "--print-address=3"};
    daemon.inherited = addresses.writing();
    const device::Process process = device::startDetached(daemon);
    addresses.closeWriting();
    try {
        const std::string address = addresses.readLine();
        if (address.empty()) {
            throw device::Error("the device's bus did not start (" + program.string() + ")");
        }
        writeWhole(folder_.busAddress(), address + "\n");
        writeWhole(folder_.busProcess(), std::to_string(process.id()) + "\n");
    } catch (const device::Error&) {
        process.end();
        removeFiles();
        throw;
    }
}

void PrivateBus::stop() const {
    if (const std::optional<device::Process> daemon = process()) {
        daemon->end();
    }
    removeFiles();
}

}  // namespace tool
