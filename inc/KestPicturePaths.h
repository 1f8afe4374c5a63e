#pragma once

#include <string>

/// The files of a page's pictures, told by their names. "a_01.png" is followed by "a_02.png"; "a_01_touch.png" lies
/// over it, and "a_russia_01.png" takes its place for Russian. Static; holds no state.
class KestPicturePaths {
public:
    /// Something other than a directory or a special file is there.
    static bool isAccessible(const std::string& path);

    /// The path of the second picture of a sequence; empty when the name is too short to have one.
    static std::string second(const std::string& first);
    /// The path that follows that of the second or a later picture: its two digits count on. Empty when the name is
    /// too short.
    static std::string next(const std::string& path);

    /// The marker that shows where to touch. Where the path has no '.' only its beginning remains.
    static std::string touch(const std::string& picture);
    /// The picture for Russian. Where the path has no '_' only its beginning remains.
    static std::string russian(const std::string& picture);
};
