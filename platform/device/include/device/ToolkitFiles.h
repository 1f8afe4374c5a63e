#pragma once

#include "device/Folder.h"

namespace device {

/// Has EFL keep its files in the device's folder: configuration, caches and, where the environment names no run
/// directory of this user, that too, without which EFL ends the process. To be called before EFL starts.
void keepToolkitFilesIn(const Folder& folder);

}  // namespace device
