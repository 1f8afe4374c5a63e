#pragma once

#include "device/Folder.h"
#include "device/Process.h"

#include <filesystem>
#include <optional>

namespace tool {

/// The bus that a device runs for itself where the workstation has no session bus: a dbus-daemon whose address and
/// process stand in the device's folder. It outlives this object; stop() ends it.
class PrivateBus {
public:
    explicit PrivateBus(const device::Folder& folder) : folder_(folder) {}

    /// The daemon, as long as it runs.
    std::optional<device::Process> process() const;
    /// Starts the daemon and returns when it takes connections. What a killed daemon left behind is replaced.
    /// Throws device::Error when that fails.
    void start() const;
    /// Ends the daemon, if it runs, and removes what it left. Throws device::Error when it does not end.
    void stop() const;

private:
    std::filesystem::path recordedSocket() const;
    std::filesystem::path chooseSocket() const;
    void removeFiles() const;

    const device::Folder& folder_;
};

}  // namespace tool
