#include "KestFiles.h"

#include <sys/stat.h>

#include <fstream>

namespace {

bool isRegular(const std::string& path) {
    struct stat status;
    return stat(path.c_str(), &status) == 0 && S_ISREG(status.st_mode);
}

}  // namespace

bool KestFiles::isSpecial(const std::string& path) {
    struct stat status;
    return stat(path.c_str(), &status) == 0 && !S_ISREG(status.st_mode);
}

bool KestFiles::read(const std::string& path, size_t most, std::string& text) {
    text.clear();
    std::ifstream file;
    if (isRegular(path)) {
        file.open(path, std::ios::binary);
    }
    if (!file.is_open()) {
        return false;
    }
    char part[16 * 1024];
    while (text.size() <= most && file.read(part, sizeof(part)).gcount() > 0) {
        text.append(part, static_cast<size_t>(file.gcount()));
    }
    return text.size() <= most && !file.bad();
}
