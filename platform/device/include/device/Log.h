#pragma once

#include <filesystem>
#include <memory>
#include <mutex>
#include <string>
#include <string_view>

namespace device {

/// The device's log: a text file, one line a call, appended whole so that processes can share it:
///
///     2026-01-31 12:00:00.123 I TAG(4711) message
///
/// Levels are D, I, W, E, F. A line break in the message is written as "\n", other control characters but the
/// escape that begins a colour as "\xNN". Lines also go to standard error when that is a terminal.
/// Past 4 MiB the file becomes device.log.1, replacing the one before.
class Log {
public:
    enum class Level { Debug = 3, Info = 4, Warning = 5, Error = 6, Fatal = 7 };

    explicit Log(std::filesystem::path file);
    ~Log();

    /// False when the line could not be written (disk full, no such folder). Never throws.
    bool write(Level level, std::string_view tag, std::string_view message) noexcept;

    const std::filesystem::path& file() const { return file_; }

private:
    class OpenFile;

    std::filesystem::path file_;
    /// EFL writes from its threads too.
    std::mutex mutex_;
    std::unique_ptr<OpenFile> open_;
};

}  // namespace device
