#include "LogFile.h"

#include "device/Error.h"

#include <array>
#include <cerrno>
#include <cstring>
#include <fcntl.h>
#include <sys/stat.h>
#include <unistd.h>

namespace tool {

LogFile::~LogFile() {
    if (descriptor_ >= 0) {
        close(descriptor_);
    }
}

bool LogFile::open() {
    descriptor_ = ::open(file_.c_str(), O_RDONLY | O_CLOEXEC | O_NONBLOCK);
    if (descriptor_ < 0 && errno != ENOENT) {
        throw device::Error("cannot read the log " + file_.string() + ": " + std::strerror(errno));
    }
    return descriptor_ >= 0;
}

bool LogFile::wasReplaced() const {
    struct stat opened {};
    struct stat named {};
    return fstat(descriptor_, &opened) == 0 && stat(file_.c_str(), &named) == 0 && opened.st_ino != named.st_ino;
}

void LogFile::readOpenFile(const std::function<void(const std::string& line)>& take) {
    std::array<char, 65536> block{};
    ssize_t count = 0;
    while ((count = read(descriptor_, block.data(), block.size())) > 0) {
        unfinished_.append(block.data(), static_cast<std::size_t>(count));
        std::size_t begin = 0;
        for (std::size_t end = 0; (end = unfinished_.find('\n', begin)) != std::string::npos; begin = end + 1) {
            take(unfinished_.substr(begin, end - begin));
        }
        unfinished_.erase(0, begin);
    }
    if (count < 0 && errno != EINTR) {
        throw device::Error("cannot read the log " + file_.string() + ": " + std::strerror(errno));
    }
}

void LogFile::readNewLines(const std::function<void(const std::string& line)>& take) {
    if (descriptor_ < 0 && !open()) {
        return;
    }
    // Asked before reading: what was added to the old file until it was renamed is read in any case.
    const bool replaced = wasReplaced();
    readOpenFile(take);
    if (replaced) {
        close(descriptor_);
        unfinished_.clear();
        if (open()) {
            readOpenFile(take);
        }
    }
}

}  // namespace tool
