#pragma once

#include "device/Descriptor.h"

#include <chrono>
#include <filesystem>
#include <string>

namespace device {

/// Keeps other processes out while it lives, by a lock on a file that it makes.
class FileLock {
public:
    /// Throws Error when the file cannot be made, or when another process holds it for longer than `patience`.
    explicit FileLock(const std::filesystem::path& file, std::chrono::milliseconds patience = std::chrono::seconds(5));

private:
    Descriptor file_;
};

/// One line of text for an errno.
std::string reasonOf(int error);

}  // namespace device
