#pragma once

#include <string>

/// What the application asks of a file before it, or a library for it, opens it. Static; holds no state.
class KestFiles {
public:
    /// Something is there, but no regular file: opening a FIFO would wait for its writer.
    static bool isSpecial(const std::string& path);
    /// The whole file, of at most so many bytes. False for what is missing, no regular file, longer or not readable.
    static bool read(const std::string& path, size_t most, std::string& text);
};
