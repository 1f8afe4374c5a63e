#include "InstanceLock.h"

#include <device/Error.h>

#include <cstring>
#include <filesystem>

#include <errno.h>
#include <fcntl.h>
#include <sys/file.h>
#include <unistd.h>

namespace app_assist {

namespace {

int openLockFile(const std::filesystem::path& file) {
    const int descriptor = open(file.c_str(), O_RDWR | O_CREAT | O_CLOEXEC, 0600);
    if (descriptor < 0)
        throw device::Error(file.string() + ": " + std::strerror(errno) + "; make the device's folder writable");
    return descriptor;
}

}  // namespace

InstanceLock::InstanceLock(device::Device& device)
    : descriptor_(openLockFile(device.folder().applicationLock(device.application().id))),
      held_(flock(descriptor_, LOCK_EX | LOCK_NB) == 0) {}

InstanceLock::~InstanceLock() {
    close(descriptor_);
}

}  // namespace app_assist
