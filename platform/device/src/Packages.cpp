#include "device/Packages.h"

#include "Files.h"
#include "ManifestMemory.h"
#include "PackageFiles.h"
#include "device/BusName.h"
#include "device/Database.h"
#include "device/Error.h"
#include "device/Events.h"
#include "device/Folder.h"

#include <algorithm>
#include <cerrno>
#include <set>
#include <utility>

namespace device {
namespace {

constexpr char installationPrefix[] = ".installing-";
constexpr char removalPrefix[] = ".removing-";
constexpr char lockName[] = ".lock";

/// A folder that goes with everything in it.
class Scratch {
public:
    explicit Scratch(std::filesystem::path folder) : folder_(std::move(folder)) {}
    ~Scratch() {
        std::error_code ignored;
        std::filesystem::remove_all(folder_, ignored);
    }
    Scratch(const Scratch&) = delete;
    Scratch& operator=(const Scratch&) = delete;
    const std::filesystem::path& path() const { return folder_; }

private:
    std::filesystem::path folder_;
};

bool isInside(const std::filesystem::path& path, const std::filesystem::path& folder) {
    const auto [folderEnd, pathEnd] = std::mismatch(folder.begin(), folder.end(), path.begin(), path.end());
    return folderEnd == folder.end();
}

std::filesystem::path checkedSource(const std::filesystem::path& source, const Folder& folder) {
    std::error_code error;
    std::filesystem::path resolved = std::filesystem::canonical(source, error);
    if (error)
        throw Error(source.string() + ": " + error.message() + "; name the folder of a package");
    if (!std::filesystem::is_directory(resolved, error))
        throw Error(source.string() + ": is not a folder; name the folder of a package");
    if (isInside(resolved, folder.root()) || isInside(folder.root(), resolved))
        throw Error(source.string() + ": the device's own folder " + folder.root().string() +
                    " and the package lie in each other; install from another folder");
    return resolved;
}

void makeAppsFolder(const std::filesystem::path& apps) {
    std::error_code error;
    std::filesystem::create_directories(apps, error);
    if (error)
        throw Error(apps.string() + ": cannot be made: " + error.message() + "; make the device's folder writable");
}

/// A folder without a manifest is somebody else's, or what is left of a package.
bool isPackage(const std::filesystem::path& folder) {
    std::error_code error;
    return std::filesystem::exists(folder / "tizen-manifest.xml", error);
}

std::set<std::string> foldersIn(const std::filesystem::path& parent) {
    std::set<std::string> names;
    std::error_code error;
    for (const auto& entry : std::filesystem::directory_iterator(parent, error))
        if (entry.is_directory(error))
            names.insert(entry.path().filename().string());
    return names;
}

bool isRemoved(Database& database, const std::string& id) {
    return database.guarded(
        [&] { return database.query("SELECT 1 FROM package WHERE id = ? AND state = 'removed'", id)->executeStep(); });
}

void noteRemoval(Database& database, const std::string& id) {
    database.guarded([&] {
        database
            .query("INSERT INTO package (id, state) VALUES (?, 'removed') "
                   "ON CONFLICT DO UPDATE SET state = excluded.state",
                   id)
            ->exec();
    });
}

/// Moves it to `where`. Throws Error when that fails; what is not there needs no moving.
void moveAway(const std::filesystem::path& folder, const std::filesystem::path& where) {
    std::error_code error;
    std::filesystem::rename(folder, where, error);
    if (error && error != std::errc::no_such_file_or_directory)
        throw Error(folder.string() + ": cannot be removed: " + error.message() + "; move it away by hand");
}

/// What an installation or a removal that was cut short has left.
void removeRemains(const std::filesystem::path& apps) {
    for (const std::string& name : foldersIn(apps))
        if (name.starts_with(installationPrefix) || name.starts_with(removalPrefix))
            Scratch(apps / name);
}

}  // namespace

Packages::Packages(Database& database, Events& events, const Folder& folder,
                   std::vector<std::filesystem::path> preinstalled)
    : database_(database), events_(events), folder_(folder), preinstalled_(std::move(preinstalled)),
      manifests_(std::make_unique<ManifestMemory>()) {}

Packages::~Packages() = default;

std::optional<std::filesystem::path> Packages::rootOf(const std::string& id) const {
    if (!BusName::isValid(id))
        return std::nullopt;
    if (isPackage(folder_.apps() / id))
        return folder_.apps() / id;
    if (isRemoved(database_, id))
        return std::nullopt;
    return shippedRootOf(id);
}

std::optional<std::filesystem::path> Packages::shippedRootOf(const std::string& id) const {
    std::error_code error;
    for (const std::filesystem::path& folder : preinstalled_)
        if (std::filesystem::is_directory(folder / id, error))
            return folder / id;
    return std::nullopt;
}

Package Packages::read(const std::string& id, const std::filesystem::path& root) const {
    Package package = manifests_->read(root);
    if (package.id != id)
        throw Error((root / "tizen-manifest.xml").string() + ": the package's id \"" + package.id +
                    "\" differs from the name of its folder; they must be equal");
    package.preinstalled = root.parent_path() != folder_.apps();
    return package;
}

std::optional<Package> Packages::find(const std::string& id) const {
    const std::optional<std::filesystem::path> root = rootOf(id);
    return root ? std::optional(read(id, *root)) : std::nullopt;
}

std::vector<Package> Packages::all() const {
    std::set<std::string> ids = foldersIn(folder_.apps());
    for (const std::filesystem::path& folder : preinstalled_)
        ids.merge(foldersIn(folder));
    std::vector<Package> packages;
    for (const std::string& id : ids) {
        const std::optional<std::filesystem::path> root = rootOf(id);
        if (!root)
            continue;
        try {
            packages.push_back(read(id, *root));
        } catch (const Error&) {
            continue;
        }
    }
    return packages;
}

Package Packages::install(const std::filesystem::path& source) {
    const std::filesystem::path from = checkedSource(source, folder_);
    const std::string id = readManifest(from).id;
    PackageEvent event{id, rootOf(id) ? PackageEvent::Type::Update : PackageEvent::Type::Install};
    events_.publishPackage(event);
    try {
        place(from, id, event);
    } catch (const std::exception&) {
        publishFailure(event);
        throw;
    }
    publishCompletion(event);
    return read(id, folder_.apps() / id);
}

void Packages::place(const std::filesystem::path& from, const std::string& id, PackageEvent event) {
    makeAppsFolder(folder_.apps());
    const FileLock lock(folder_.apps() / lockName);
    removeRemains(folder_.apps());
    const Scratch fresh(makeTemporaryFolder(folder_.apps(), installationPrefix));
    copyPackage(from, fresh.path());
    if (readManifest(fresh.path()).id != id)
        throw Error(from.string() + ": changed while it was copied; install it again");
    event.state = PackageEvent::State::Processing;
    event.progress = 50;
    events_.publishPackage(event);
    replaceFolder(fresh.path(), folder_.apps() / id);
}

void Packages::uninstall(const std::string& id) {
    if (!rootOf(id))
        throw Error("\"" + id + "\" is not installed; see the device's list of packages");
    PackageEvent event{id, PackageEvent::Type::Uninstall};
    events_.publishPackage(event);
    try {
        remove(id, event);
    } catch (const std::exception&) {
        publishFailure(event);
        throw;
    }
    publishCompletion(event);
}

void Packages::remove(const std::string& id, PackageEvent event) {
    makeAppsFolder(folder_.apps());
    const FileLock lock(folder_.apps() / lockName);
    event.state = PackageEvent::State::Processing;
    event.progress = 50;
    events_.publishPackage(event);
    const Scratch removed(makeTemporaryFolder(folder_.apps(), removalPrefix));
    // As long as the folder stands, this note counts for nothing. Written after the folder has gone, it would let the
    // package that the folder covered come up in between.
    if (shippedRootOf(id))
        noteRemoval(database_, id);
    if (isPackage(folder_.apps() / id))
        moveAway(folder_.apps() / id, removed.path() / id);
}

std::vector<std::string> Packages::removeInstalled(const Folder& folder) {
    std::vector<std::string> ids;
    if (foldersIn(folder.apps()).empty())
        return ids;
    const FileLock lock(folder.apps() / lockName);
    removeRemains(folder.apps());
    const Scratch removed(makeTemporaryFolder(folder.apps(), removalPrefix));
    for (const std::string& name : foldersIn(folder.apps())) {
        if (!isPackage(folder.apps() / name))
            continue;
        moveAway(folder.apps() / name, removed.path() / name);
        ids.push_back(name);
    }
    return ids;
}

void Packages::publishCompletion(PackageEvent event) {
    event.state = PackageEvent::State::Completed;
    event.progress = 100;
    events_.publishPackage(event);
}

void Packages::publishFailure(PackageEvent event) {
    event.state = PackageEvent::State::Failed;
    event.error = -EIO;
    events_.publishPackage(event);
}

}  // namespace device
