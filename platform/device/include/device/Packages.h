#pragma once

#include "device/Link.h"

#include <filesystem>
#include <map>
#include <memory>
#include <optional>
#include <string>
#include <vector>

namespace device {

class Database;
class Events;
class Folder;
class ManifestMemory;
struct PackageEvent;

/// What a package's tizen-manifest.xml says of it, and where it lies.
struct Package {
    std::string id;       ///< package id, equal to the id of its application
    std::string version;  ///< possibly empty
    std::string label;    ///< the application's name; the id when the manifest gives none
    /// Its names in languages, as "ko_kr" or "ko".
    std::map<std::string, std::string> labels;
    std::string icon;            ///< absolute path of the icon; empty when the manifest names none
    std::string exec;            ///< absolute path of the executable; empty when the manifest names none
    std::optional<Link> link;    ///< how links lead into the application; none: no link does
    std::filesystem::path root;  ///< the package's folder; shared resources are in root/shared/res/
    bool preinstalled = false;   ///< true: part of the build; false: installed on this device

    /// The application's name in a display language ("ko_KR"): the one of that language and country, else of the
    /// language alone, else the one for all.
    const std::string& labelIn(const std::string& language) const;
};

/// Reads `<root>/tizen-manifest.xml`.
/// Throws Error, naming file and line, when it is missing, no regular file, not well formed, lacks the package
/// id, gives an application id that differs from the package id, an id that is no valid bus name, or a form of links
/// that is none.
Package readManifest(const std::filesystem::path& root);

/// The packages of the device: those that the build ships, read where they lie, as changed by what was
/// installed and removed on this device. Installed is what has its folder with its manifest there, whatever the
/// database says or has lost; the database tells which of the build's packages were removed.
/// Of what was read it keeps only manifests, until their files change.
/// All throw Error when the database fails.
class Packages {
public:
    Packages(Database& database, Events& events, const Folder& folder, std::vector<std::filesystem::path> preinstalled);
    ~Packages();

    /// The package's folder, without reading its manifest; nullopt when it is not installed.
    std::optional<std::filesystem::path> rootOf(const std::string& id) const;
    /// nullopt when it is not installed. Throws Error when its manifest is broken.
    std::optional<Package> find(const std::string& id) const;
    /// All packages in the order of their ids; one with a broken manifest is left out.
    std::vector<Package> all() const;

    /// Copies the package in `source` onto the device and returns it. An installed package of the same id is
    /// replaced (an update). Publishes started, processing and completed or failed; the copy is in place before
    /// "completed", and nothing has changed after "failed".
    /// Throws Error when the manifest is broken (before anything is published), when the package holds something
    /// else than files and folders, when it and the device's folder lie in each other, or when the copy fails.
    Package install(const std::filesystem::path& source);
    /// Removes the package from the device, also one that the build ships (which stays where it lies).
    /// Publishes as install() does. Throws Error when it is not installed, or cannot be removed and stays.
    void uninstall(const std::string& id);

    /// Removes all that was installed on the device, and what was cut short has left; other folders stay. Killed at any
    /// moment, it has removed each package whole or not at all. Publishes nothing: no application runs meanwhile.
    /// Returns the ids. Throws Error when one cannot be removed.
    static std::vector<std::string> removeInstalled(const Folder& folder);

private:
    std::optional<std::filesystem::path> shippedRootOf(const std::string& id) const;
    Package read(const std::string& id, const std::filesystem::path& root) const;
    void place(const std::filesystem::path& from, const std::string& id, PackageEvent event);
    void remove(const std::string& id, PackageEvent event);
    void publishCompletion(PackageEvent event);
    void publishFailure(PackageEvent event);

    Database& database_;
    Events& events_;
    const Folder& folder_;
    std::vector<std::filesystem::path> preinstalled_;
    std::unique_ptr<ManifestMemory> manifests_;
};

}  // namespace device
