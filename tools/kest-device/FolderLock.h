#pragma once

#include "device/Folder.h"

namespace tool {

/// Keeps other runs of the tool from starting, stopping or resetting the same device meanwhile; waits for one that
/// does. It locks the folder itself and leaves no file.
class FolderLock {
public:
    /// Throws device::Error when the folder cannot be opened.
    explicit FolderLock(const device::Folder& folder);
    ~FolderLock();
    FolderLock(const FolderLock&) = delete;
    FolderLock& operator=(const FolderLock&) = delete;

private:
    int descriptor_;
};

}  // namespace tool
