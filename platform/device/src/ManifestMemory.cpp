#include "ManifestMemory.h"

#include <chrono>
#include <sys/stat.h>

namespace device {
namespace {

/// The file system's clock has steps; a file may change twice within one and look the same.
constexpr std::chrono::milliseconds clockStep(100);

std::chrono::nanoseconds timeOf(const timespec& time) {
    return std::chrono::seconds(time.tv_sec) + std::chrono::nanoseconds(time.tv_nsec);
}

bool hasSettled(const struct stat& status) {
    return timeOf(status.st_mtim) < std::chrono::system_clock::now().time_since_epoch() - clockStep;
}

}  // namespace

Package ManifestMemory::read(const std::filesystem::path& root) {
    struct stat status {};
    if (stat((root / "tizen-manifest.xml").c_str(), &status) != 0)
        return readManifest(root);
    const Version version{status.st_dev, status.st_ino, status.st_size, timeOf(status.st_ctim)};
    const auto known = known_.find(root);
    if (known != known_.end() && known->second.version == version)
        return known->second.package;
    Package package = readManifest(root);
    if (hasSettled(status))
        known_.insert_or_assign(root, Known{version, package});
    return package;
}

}  // namespace device
