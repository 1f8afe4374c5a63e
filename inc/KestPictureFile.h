#pragma once

#include <string>

/// What a picture's file tells by its bytes before it is decoded. Static; holds no state.
class KestPictureFile {
public:
    /// False for a PNG that breaks off before its end: its size can be read, its pixels cannot. Other files, also those
    /// that are missing or no pictures, count as whole.
    static bool isWhole(const std::string& path);
};
