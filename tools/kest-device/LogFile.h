#pragma once

#include <filesystem>
#include <functional>
#include <string>

namespace tool {

/// Reads the lines of a log from its beginning and then what is added, also after the file was renamed and begun
/// anew. A line counts once it is whole.
class LogFile {
public:
    explicit LogFile(std::filesystem::path file) : file_(std::move(file)) {}
    ~LogFile();
    LogFile(const LogFile&) = delete;
    LogFile& operator=(const LogFile&) = delete;

    /// Hands out the lines that were added since the last call, without their ends. A file that is not there has none.
    /// Throws device::Error when the file cannot be read.
    void readNewLines(const std::function<void(const std::string& line)>& take);

private:
    bool open();
    bool wasReplaced() const;
    void readOpenFile(const std::function<void(const std::string& line)>& take);

    std::filesystem::path file_;
    int descriptor_ = -1;
    std::string unfinished_;
};

}  // namespace tool
