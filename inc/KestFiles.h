#pragma once

#include <cstdint>
#include <string>

/// What the application asks of a file before it, or a library for it, opens it. Static; holds no state.
class KestFiles {
public:
    /// False for a missing file too.
    static bool isRegular(const std::string& path);
    /// Something is there, but no regular file: opening a FIFO would wait for its writer.
    static bool isSpecial(const std::string& path);
    /// In bytes; 0 for a missing file.
    static std::uintmax_t size(const std::string& path);
    /// The first bytes of the file, at most so many; none of a file that cannot be read.
    static std::string readBegin(const std::string& path, size_t length);
};
