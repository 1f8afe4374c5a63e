#pragma once

#include "device/Descriptor.h"

#include <Ecore.h>

#include <filesystem>
#include <functional>

/// Tells, from the main loop, when a folder is removed or moved away.
class FolderWatch {
public:
    /// Where the system has no watch left, nothing is told.
    FolderWatch(std::filesystem::path folder, std::function<void()> gone);
    ~FolderWatch();
    FolderWatch(const FolderWatch&) = delete;
    FolderWatch& operator=(const FolderWatch&) = delete;

private:
    static Eina_Bool onEvent(void* watch, Ecore_Fd_Handler* handler) noexcept;

    std::filesystem::path folder_;
    std::function<void()> gone_;
    device::Descriptor events_;
    Ecore_Fd_Handler* handler_ = nullptr;
};
