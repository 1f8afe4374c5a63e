#pragma once

#include <device/Device.h>

namespace app_assist {

/// Keeps an application to one process a device, also where there is no bus to tell of the first: two would write
/// each other's preferences over. Held until it is destroyed or the process ends, however it ends.
class InstanceLock {
public:
    /// Takes the lock of the device's application, unless another process has it.
    /// Throws device::Error when its file cannot be made.
    explicit InstanceLock(device::Device& device);
    ~InstanceLock();
    InstanceLock(const InstanceLock&) = delete;
    InstanceLock& operator=(const InstanceLock&) = delete;

    bool isHeld() const { return held_; }

private:
    int descriptor_;
    bool held_;
};

}  // namespace app_assist
