#include "KestPicturePaths.h"

#include "KestFiles.h"

#include <algorithm>
#include <cstdio>
#include <cstdlib>

#include <unistd.h>

namespace {

const size_t longestPath = 255;

/// Of "_01.png": what stands behind the name, with and without the dot's neighbours.
const size_t extensionLength = 4;
const size_t numberAndExtensionLength = 6;
const size_t separatorNumberAndExtensionLength = 7;

/// The path without its last `count` characters, then `mark`, then the path from its last `separator` on.
std::string withMark(const std::string& path, size_t count, const std::string& mark, char separator) {
    const size_t kept = path.size() - std::min(count, path.size());
    std::string marked = path.substr(0, std::min(kept, longestPath));
    const size_t from = path.rfind(separator);
    if (from != std::string::npos) {
        marked.append(mark, 0, longestPath - marked.size());
        marked.append(path, from, longestPath - marked.size());
    }
    return marked;
}

}  // namespace

bool KestPicturePaths::isAccessible(const std::string& path) {
    return !path.empty() && access(path.c_str(), F_OK) == 0 && !KestFiles::isSpecial(path);
}

std::string KestPicturePaths::second(const std::string& first) {
    if (first.size() <= extensionLength) {
        return "";
    }
    std::string path = first;
    path[path.size() - extensionLength - 1] = '2';
    return path;
}

std::string KestPicturePaths::next(const std::string& path) {
    if (path.size() < numberAndExtensionLength) {
        return "";
    }
    const size_t begin = path.size() - numberAndExtensionLength;
    const long number = std::strtol(path.substr(begin, 2).c_str(), nullptr, 10);
    // Two digits: after 99 comes 10.
    char digits[3];
    const int length = std::snprintf(digits, sizeof(digits), "%02ld", number + 1);
    return length < 0 ? "" : path.substr(0, begin) + digits + path.substr(path.size() - extensionLength);
}

std::string KestPicturePaths::touch(const std::string& picture) {
    return withMark(picture, extensionLength, "_touch", '.');
}

std::string KestPicturePaths::russian(const std::string& picture) {
    return withMark(picture, separatorNumberAndExtensionLength, "_russia", '_');
}
