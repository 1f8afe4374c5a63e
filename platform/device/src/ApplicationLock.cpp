#include "device/ApplicationLock.h"

#include "Files.h"
#include "device/BusName.h"
#include "device/Error.h"
#include "device/Folder.h"

#include <algorithm>
#include <cerrno>
#include <fcntl.h>

namespace device {
namespace {

Descriptor openLockFile(const std::filesystem::path& file) {
    Descriptor descriptor(open(file.c_str(), O_RDWR | O_CREAT | O_CLOEXEC | O_NOFOLLOW, 0600));
    if (!descriptor)
        throw Error(file.string() + ": " + reasonOf(errno) + "; make the device's folder writable");
    return descriptor;
}

/// Of the whole file. A lock of this kind tells who has it, and no child process inherits it.
struct flock wholeFile() {
    struct flock lock {};
    lock.l_type = F_WRLCK;
    lock.l_whence = SEEK_SET;
    return lock;
}

bool take(int descriptor) {
    struct flock lock = wholeFile();
    return fcntl(descriptor, F_SETLK, &lock) == 0;
}

}  // namespace

ApplicationLock::ApplicationLock(const Folder& folder, const std::string& appId)
    : file_(openLockFile(folder.applicationLock(appId))), held_(take(file_.get())) {}

std::optional<pid_t> ApplicationLock::holder(const Folder& folder, const std::string& appId) {
    const Descriptor file(open(folder.applicationLock(appId).c_str(), O_RDONLY | O_CLOEXEC | O_NONBLOCK | O_NOFOLLOW));
    struct flock lock = wholeFile();
    if (!file || fcntl(file.get(), F_GETLK, &lock) != 0 || lock.l_type == F_UNLCK)
        return std::nullopt;
    return lock.l_pid;
}

std::vector<std::string> ApplicationLock::applications(const Folder& folder) {
    std::vector<std::string> ids;
    std::error_code error;
    for (const auto& entry : std::filesystem::directory_iterator(folder.root(), error)) {
        const std::string id = entry.path().stem();
        if (BusName::isValid(id) && entry.path() == folder.applicationLock(id) && entry.path() != folder.databaseLock())
            ids.push_back(id);
    }
    std::sort(ids.begin(), ids.end());
    return ids;
}

}  // namespace device
