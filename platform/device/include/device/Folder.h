#pragma once

#include <filesystem>
#include <string>

namespace device {

/// Where a device lives on the workstation's disk: one folder, private to its user, with a fixed layout.
/// Knows paths only; it opens nothing and holds no state.
class Folder {
public:
    /// The folder that the environment names: $KEST_DEVICE, else the build's folder name under
    /// $XDG_STATE_HOME, else under ~/.local/state.
    /// Throws Error when none of the three is set, and as the constructor does.
    static Folder resolve();

    /// Makes the path absolute and follows the links in it, so that one folder has one name in all processes.
    /// Throws Error when it holds a blank, a control character, one of <>&"' or bytes that are not UTF-8: the
    /// applications' markup refers to files as `href=file:PATH`, which cannot carry them.
    explicit Folder(const std::filesystem::path& root);

    /// Makes the folder (mode 0700) with its parents, if it is not there.
    /// Throws Error when it cannot be made or written, or when something else stands in its place.
    void create() const;

    const std::filesystem::path& root() const { return root_; }
    std::filesystem::path database() const { return root_ / "device.db"; }
    /// Held while the database is opened, made or set aside.
    std::filesystem::path databaseLock() const { return root_ / "device.db.lock"; }
    /// There while the database waits for a full check, because a page of it was found damaged in use.
    std::filesystem::path databaseSuspicion() const { return root_ / "device.db.suspect"; }
    std::filesystem::path log() const { return root_ / "device.log"; }
    /// Packages installed on this device only, laid out as under the device's own /opt/usr/apps.
    std::filesystem::path apps() const { return root_ / "opt/usr/apps"; }
    /// What each application wrote to its standard output and error since it was started last.
    std::filesystem::path outputs() const { return root_ / "output"; }
    std::filesystem::path output(const std::string& appId) const { return outputs() / (appId + ".log"); }
    /// What the toolkit writes for itself (configuration, caches, run directory).
    std::filesystem::path toolkit() const { return root_ / "toolkit"; }
    /// The private bus: its socket, the file with its address, and the file with its daemon's process id.
    std::filesystem::path busSocket() const { return root_ / "bus"; }
    std::filesystem::path busAddress() const { return root_ / "bus.address"; }
    std::filesystem::path busProcess() const { return root_ / "bus.pid"; }
    /// Held by the process that is the application.
    std::filesystem::path applicationLock(const std::string& appId) const { return root_ / (appId + ".lock"); }

private:
    std::filesystem::path root_;
};

}  // namespace device
