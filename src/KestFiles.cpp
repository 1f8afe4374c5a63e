#include "KestFiles.h"

#include <sys/stat.h>

#include <algorithm>
#include <fstream>

bool KestFiles::isRegular(const std::string& path) {
    struct stat status;
    return stat(path.c_str(), &status) == 0 && S_ISREG(status.st_mode);
}

bool KestFiles::isSpecial(const std::string& path) {
    struct stat status;
    return stat(path.c_str(), &status) == 0 && !S_ISREG(status.st_mode);
}

std::uintmax_t KestFiles::size(const std::string& path) {
    struct stat status;
    return stat(path.c_str(), &status) == 0 ? static_cast<std::uintmax_t>(status.st_size) : 0;
}

std::string KestFiles::readBegin(const std::string& path, size_t length) {
    std::ifstream file(path, std::ios::binary);
    std::string begin(std::min(length, static_cast<size_t>(size(path))), '\0');
    file.read(&begin[0], static_cast<std::streamsize>(begin.size()));
    begin.resize(static_cast<size_t>(file.gcount()));
    return begin;
}
