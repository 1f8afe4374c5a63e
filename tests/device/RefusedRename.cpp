#include "RefusedRename.h"

#include <cerrno>
#include <cstdio>
#include <fcntl.h>
#include <sys/syscall.h>
#include <unistd.h>
#include <utility>

namespace {

const RefusedRename* refusal = nullptr;

int renamed(int fromFolder, const char* from, int toFolder, const char* to, unsigned flags) {
    const int error = refusal ? refusal->errorOf(from, (flags & RENAME_EXCHANGE) != 0) : 0;
    if (error != 0) {
        errno = error;
        return -1;
    }
    return static_cast<int>(syscall(SYS_renameat2, fromFolder, from, toFolder, to, flags));
}

}  // namespace

// The program's own come before the C library's.
extern "C" int rename(const char* from, const char* to) noexcept {
    return renamed(AT_FDCWD, from, AT_FDCWD, to, 0);
}
extern "C" int renameat2(int fromFolder, const char* from, int toFolder, const char* to, unsigned flags) noexcept {
    return renamed(fromFolder, from, toFolder, to, flags);
}

RefusedRename::RefusedRename(std::function<bool(const std::string&)> refuses, bool canExchange)
    : refuses_(std::move(refuses)), canExchange_(canExchange) {
    refusal = this;
}

RefusedRename::~RefusedRename() {
    refusal = nullptr;
}

int RefusedRename::errorOf(const std::string& from, bool exchange) const {
    if (exchange && !canExchange_)
        return EINVAL;
    return refuses_(from) ? EACCES : 0;
}
