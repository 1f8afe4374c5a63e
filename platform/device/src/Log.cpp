#include "device/Log.h"

#include "Files.h"

#include <cerrno>
#include <chrono>
#include <cstdio>
#include <ctime>
#include <exception>
#include <fcntl.h>
#include <string>
#include <sys/file.h>
#include <sys/stat.h>
#include <unistd.h>
#include <utility>

namespace device {
namespace {

constexpr off_t largestFile = 4 * 1024 * 1024;

char letterOf(Log::Level level) {
    switch (level) {
    case Log::Level::Debug:
        return 'D';
    case Log::Level::Info:
        return 'I';
    case Log::Level::Warning:
        return 'W';
    case Log::Level::Error:
        return 'E';
    case Log::Level::Fatal:
        break;
    }
    return 'F';
}

std::string timeNow() {
    const auto now = std::chrono::system_clock::now();
    const std::time_t seconds = std::chrono::system_clock::to_time_t(now);
    const auto milliseconds =
        std::chrono::duration_cast<std::chrono::milliseconds>(now.time_since_epoch()).count() % 1000;
    std::tm local{};
    localtime_r(&seconds, &local);
    char text[64];
    const std::size_t length = std::strftime(text, sizeof text, "%Y-%m-%d %H:%M:%S", &local);
    std::snprintf(text + length, sizeof text - length, ".%03d", static_cast<int>(milliseconds));
    return text;
}

bool beginsColour(std::string_view rest) {
    if (rest.size() < 3 || rest[0] != '\x1b' || rest[1] != '[')
        return false;
    const std::size_t end = rest.find_first_not_of("0123456789;", 2);
    return end != std::string_view::npos && rest[end] == 'm';
}

void appendEscaped(std::string& line, std::string_view text) {
    for (std::size_t at = 0; at < text.size(); ++at) {
        const auto byte = static_cast<unsigned char>(text[at]);
        if (byte == '\n') {
            line += "\\n";
        } else if ((byte < ' ' && !beginsColour(text.substr(at))) || byte == 0x7f) {
            char escape[8];
            std::snprintf(escape, sizeof escape, "\\x%02x", byte);
            line += escape;
        } else {
            line += text[at];
        }
    }
}

std::string formatted(Log::Level level, std::string_view tag, std::string_view message) {
    std::string line = timeNow();
    line.reserve(line.size() + tag.size() + message.size() + 32);
    line += {' ', letterOf(level), ' '};
    appendEscaped(line, tag);
    line += '(' + std::to_string(getpid()) + ") ";
    appendEscaped(line, message);
    line += '\n';
    return line;
}

/// One write, so that a line of one process never stands inside a line of another.
bool writeWhole(int file, const std::string& line) {
    ssize_t written = 0;
    do
        written = ::write(file, line.data(), line.size());
    while (written < 0 && errno == EINTR);
    return written == static_cast<ssize_t>(line.size());
}

void echo(const std::string& line) {
    if (isatty(STDERR_FILENO) == 1)
        writeWhole(STDERR_FILENO, line);
}

}  // namespace

/// The file as this process last opened it. Other processes may move it away or remove it at any time.
class Log::OpenFile {
public:
    /// The file that bears the name now, with room for `more` bytes; none when it cannot be opened.
    const Descriptor& withRoom(const std::filesystem::path& file, std::size_t more) {
        if (!isCurrent(file))
            open(file);
        if (descriptor_ && isFull(more)) {
            moveAway(file);
            open(file);
        }
        return descriptor_;
    }

private:
    void open(const std::filesystem::path& file) {
        descriptor_ = Descriptor(::open(file.c_str(), O_WRONLY | O_APPEND | O_CREAT | O_CLOEXEC | O_NONBLOCK, 0600));
        if (descriptor_ && fstat(descriptor_.get(), &status_) != 0)
            descriptor_ = Descriptor();
    }

    bool isCurrent(const std::filesystem::path& file) {
        struct stat named {};
        if (!descriptor_ || stat(file.c_str(), &named) != 0 || named.st_ino != status_.st_ino ||
            named.st_dev != status_.st_dev)
            return false;
        status_ = named;
        return true;
    }

    bool isFull(std::size_t more) const {
        return status_.st_size > 0 && status_.st_size + static_cast<off_t>(more) > largestFile;
    }

    /// Whoever holds the lock does it; the others go on in the old file.
    void moveAway(const std::filesystem::path& file) {
        if (flock(descriptor_.get(), LOCK_EX | LOCK_NB) == 0 && isCurrent(file))
            std::rename(file.c_str(), (file.string() + ".1").c_str());
    }

    Descriptor descriptor_;
    struct stat status_ {};
};

Log::Log(std::filesystem::path file) : file_(std::move(file)), open_(std::make_unique<OpenFile>()) {}

Log::~Log() = default;

bool Log::write(Level level, std::string_view tag, std::string_view message) noexcept {
    try {
        const std::string line = formatted(level, tag, message);
        echo(line);
        const std::lock_guard lock(mutex_);
        const Descriptor& file = open_->withRoom(file_, line.size());
        return file && writeWhole(file.get(), line);
    } catch (const std::exception&) {
        return false;
    }
}

}  // namespace device
