#include "device/Application.h"

#include "device/Error.h"
#include "device/Packages.h"

#include <utility>

namespace device {

Application Application::ofThisProcess() {
    std::error_code error;
    const std::filesystem::path executable = std::filesystem::read_symlink("/proc/self/exe", error);
    if (error)
        throw Error("/proc/self/exe: " + error.message() + "; mount /proc");
    const std::filesystem::path root = executable.parent_path().parent_path();
    Package package = readManifest(root);
    return {std::move(package.id), root, std::move(package.link)};
}

}  // namespace device
