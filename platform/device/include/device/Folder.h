#pragma once

#include <filesystem>

namespace device {

/// Where a device lives on the workstation's disk: one folder, private to its user, with a fixed layout.
/// Knows paths only; it opens nothing and holds no state.
class Folder {
public:
    /// The folder that the environment names: $KEST_DEVICE, else the build's folder name under
    /// $XDG_STATE_HOME, else under ~/.local/state.
    /// Throws Error when none of the three is set, and as the constructor does.
    static Folder resolve();

    /// Throws Error when the path holds a blank or a control character: the applications' markup refers to
    /// files as `href=file:PATH`, which cannot carry one.
    explicit Folder(std::filesystem::path root);

    /// Makes the folder (mode 0700) with its parents, if it is not there.
    /// Throws Error when it cannot be made or written.
    void create() const;

    const std::filesystem::path& root() const { return root_; }
    std::filesystem::path database() const { return root_ / "device.db"; }
    std::filesystem::path log() const { return root_ / "device.log"; }
    /// Packages installed on this device only, laid out as under the device's own /opt/usr/apps.
    std::filesystem::path apps() const { return root_ / "opt/usr/apps"; }
    /// What the toolkit writes for itself (configuration, caches, run directory).
    std::filesystem::path toolkit() const { return root_ / "toolkit"; }
    /// The private bus: its socket, the file with its address, and the file with its daemon's process id.
    std::filesystem::path busSocket() const { return root_ / "bus"; }
    std::filesystem::path busAddress() const { return root_ / "bus.address"; }
    std::filesystem::path busProcess() const { return root_ / "bus.pid"; }

private:
    std::filesystem::path root_;
};

}  // namespace device
