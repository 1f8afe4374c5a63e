#include "FolderLock.h"

#include "device/Error.h"

#include <cerrno>
#include <cstring>
#include <fcntl.h>
#include <string>
#include <sys/file.h>
#include <unistd.h>

namespace tool {

FolderLock::FolderLock(const device::Folder& folder)
    : descriptor_(open(folder.root().c_str(), O_RDONLY | O_DIRECTORY | O_CLOEXEC)) {
    if (descriptor_ < 0) {
        throw device::Error("cannot open the device's folder " + folder.root().string() + ": " + std::strerror(errno));
    }
    while (flock(descriptor_, LOCK_EX) != 0 && errno == EINTR) {
    }
}

FolderLock::~FolderLock() {
    close(descriptor_);
}

}  // namespace tool
