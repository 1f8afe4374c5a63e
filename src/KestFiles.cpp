#include "KestFiles.h"

#include <sys/stat.h>

bool KestFiles::isRegular(const std::string& path) {
    struct stat status;
    return stat(path.c_str(), &status) == 0 && S_ISREG(status.st_mode);
}

bool KestFiles::isSpecial(const std::string& path) {
    struct stat status;
    return stat(path.c_str(), &status) == 0 && !S_ISREG(status.st_mode);
}
