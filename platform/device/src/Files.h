#pragma once

#include <chrono>
#include <filesystem>
#include <string>

namespace device {

/// Owns a file descriptor.
class Descriptor {
public:
    explicit Descriptor(int number = -1) noexcept : number_(number) {}
    ~Descriptor();
    Descriptor(Descriptor&& other) noexcept : number_(other.release()) {}
    Descriptor& operator=(Descriptor&& other) noexcept;

    explicit operator bool() const noexcept { return number_ >= 0; }
    int get() const noexcept { return number_; }
    int release() noexcept;

private:
    int number_;
};

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
