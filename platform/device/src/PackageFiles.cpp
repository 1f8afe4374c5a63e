#include "PackageFiles.h"

#include "Files.h"
#include "device/Error.h"

#include <cerrno>
#include <cstdio>
#include <cstdlib>
#include <dirent.h>
#include <fcntl.h>
#include <memory>
#include <string_view>
#include <sys/sendfile.h>
#include <sys/stat.h>
#include <unistd.h>

namespace device {
namespace {

[[noreturn]] void fail(const std::filesystem::path& path, const std::string& what, int error) {
    throw Error(path.string() + ": " + what + ": " + reasonOf(error));
}

struct CloseFolder {
    void operator()(DIR* folder) const { closedir(folder); }
};
using OpenFolder = std::unique_ptr<DIR, CloseFolder>;

void copyFile(const Descriptor& source, const struct stat& status, const std::filesystem::path& from,
              const std::filesystem::path& to) {
    const Descriptor target(
        open(to.c_str(), O_WRONLY | O_CREAT | O_EXCL | O_CLOEXEC, (status.st_mode & 0777) | S_IWUSR));
    if (!target)
        fail(to, "cannot be written", errno);
    for (;;) {
        const ssize_t count = sendfile(target.get(), source.get(), nullptr, 1 << 20);
        if (count == 0)
            return;
        if (count < 0 && errno != EINTR)
            fail(from, "cannot be copied to " + to.string(), errno);
    }
}

void copyFolder(Descriptor source, const std::filesystem::path& from, const std::filesystem::path& to);

/// Opens before it looks, so that what is looked at is what is copied.
void copyEntry(int parent, const char* name, const std::filesystem::path& from, const std::filesystem::path& to) {
    Descriptor source(openat(parent, name, O_RDONLY | O_CLOEXEC | O_NOFOLLOW | O_NONBLOCK));
    struct stat status {};
    if (!source && errno == ELOOP)
        throw Error(from.string() + ": is a link; a package holds files and folders only, put the file itself there");
    if (!source && errno != ENXIO)
        fail(from, "cannot be read", errno);
    if (!source || fstat(source.get(), &status) != 0 || !(S_ISREG(status.st_mode) || S_ISDIR(status.st_mode)))
        throw Error(from.string() + ": is neither a file nor a folder; remove it from the package");
    if (S_ISREG(status.st_mode)) {
        copyFile(source, status, from, to);
        return;
    }
    if (mkdir(to.c_str(), 0755) != 0)
        fail(to, "cannot be made", errno);
    copyFolder(std::move(source), from, to);
}

void copyFolder(Descriptor source, const std::filesystem::path& from, const std::filesystem::path& to) {
    const OpenFolder folder(fdopendir(source.get()));
    if (!folder)
        fail(from, "cannot be read", errno);
    source.release();
    for (;;) {
        errno = 0;
        const dirent* entry = readdir(folder.get());
        if (!entry && errno != 0)
            fail(from, "cannot be read", errno);
        if (!entry)
            return;
        const std::string_view name = entry->d_name;
        if (name != "." && name != "..")
            copyEntry(dirfd(folder.get()), entry->d_name, from / name, to / name);
    }
}

}  // namespace

void copyPackage(const std::filesystem::path& from, const std::filesystem::path& to) {
    Descriptor source(open(from.c_str(), O_RDONLY | O_DIRECTORY | O_CLOEXEC));
    if (!source)
        fail(from, "cannot be read", errno);
    copyFolder(std::move(source), from, to);
}

void replaceFolder(const std::filesystem::path& fresh, const std::filesystem::path& target) {
    if (renameat2(AT_FDCWD, fresh.c_str(), AT_FDCWD, target.c_str(), RENAME_EXCHANGE) == 0)
        return;
    if (errno == ENOENT && std::rename(fresh.c_str(), target.c_str()) == 0)
        return;
    const int reason = errno;
    const std::filesystem::path old = fresh.string() + "-old";
    std::error_code ignored;
    const bool canExchange = reason != EINVAL && reason != ENOSYS && reason != EXDEV;
    if (canExchange || std::rename(target.c_str(), old.c_str()) != 0)
        fail(target, "cannot be replaced", reason);
    if (std::rename(fresh.c_str(), target.c_str()) != 0) {
        const int why = errno;
        std::filesystem::rename(old, target, ignored);
        fail(target, "cannot be replaced", why);
    }
    std::filesystem::rename(old, fresh, ignored);
}

std::filesystem::path makeTemporaryFolder(const std::filesystem::path& parent, const std::string& prefix) {
    std::string name = (parent / (prefix + "XXXXXX")).string();
    if (!mkdtemp(name.data()))
        fail(parent, "nothing can be written into it", errno);
    if (chmod(name.c_str(), 0755) != 0)
        fail(name, "cannot be made readable", errno);
    return name;
}

}  // namespace device
