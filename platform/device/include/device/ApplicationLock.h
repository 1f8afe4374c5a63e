#pragma once

#include "device/Descriptor.h"

#include <optional>
#include <string>
#include <sys/types.h>
#include <vector>

namespace device {

class Folder;

/// Keeps an application to one process a device, also where there is no bus to tell of the first: two would write
/// each other's preferences over. Held until it is destroyed or the process ends, however it ends.
class ApplicationLock {
public:
    /// Takes the application's lock, unless another process has it. Throws Error when its file cannot be made.
    ApplicationLock(const Folder& folder, const std::string& appId);

    bool isHeld() const { return held_; }

    /// The other process that has the lock: the one that is the application; nullopt when none is, 0 when it cannot be
    /// seen from here (it runs in another process namespace).
    /// Not for a process that has the lock itself, which would lose it.
    static std::optional<pid_t> holder(const Folder& folder, const std::string& appId);

    /// The applications that have run on the device, in the order of their ids: those that run now are among them.
    static std::vector<std::string> applications(const Folder& folder);

private:
    Descriptor file_;
    bool held_;
};

}  // namespace device
