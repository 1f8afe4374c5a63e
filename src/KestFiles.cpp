#include "KestFiles.h"

#include <sys/stat.h>

#include <algorithm>
#include <cstdint>
#include <fstream>
#include <limits>

bool KestFiles::isSpecial(const std::string& path) {
    struct stat status;
    return stat(path.c_str(), &status) == 0 && !S_ISREG(status.st_mode);
}

bool KestFiles::sizeOf(const std::string& path, size_t& size) {
    struct stat status;
    if (stat(path.c_str(), &status) != 0 || !S_ISREG(status.st_mode)) {
        return false;
    }
    const std::uint64_t bytes = static_cast<std::uint64_t>(status.st_size);
    size = static_cast<size_t>(std::min<std::uint64_t>(bytes, std::numeric_limits<size_t>::max()));
    return true;
}

bool KestFiles::read(const std::string& path, size_t size, std::string& text) {
    text.clear();
    if (size == 0) {
        return true;
    }
    std::ifstream file(path, std::ios::binary);
    char part[16 * 1024];
    while (text.size() <= size && file.read(part, sizeof(part)).gcount() > 0) {
        text.append(part, static_cast<size_t>(file.gcount()));
    }
    return file.is_open() && text.size() <= size && !file.bad();
}
