#pragma once

#include <string>

/// What the application asks of a file before it, or a library for it, opens it. Static; holds no state.
class KestFiles {
public:
    /// Something is there, but no regular file: opening a FIFO would wait for its writer.
    static bool isSpecial(const std::string& path);
    /// How many bytes the file has. False for what is missing or no regular file.
    static bool sizeOf(const std::string& path, size_t& size);
    /// The whole file, of sizeOf() bytes. False for what cannot be read or has become longer. An empty file is not
    /// opened: the system has files that say that they are empty, and keep their reader waiting.
    static bool read(const std::string& path, size_t size, std::string& text);
};
