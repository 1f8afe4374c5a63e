#include "device/ToolkitFiles.h"

#include <cstdlib>
#include <filesystem>
#include <sys/stat.h>
#include <system_error>
#include <unistd.h>

namespace device {
namespace {

namespace fs = std::filesystem;

/// Of this user alone, as the run directory has to be.
bool isUsableRunFolder(const char* folder) {
    struct stat status {};
    return folder && stat(folder, &status) == 0 && S_ISDIR(status.st_mode) && status.st_uid == geteuid() &&
           access(folder, W_OK | X_OK) == 0;
}

fs::path privateFolder(const fs::path& folder) {
    std::error_code ignored;
    fs::create_directories(folder, ignored);
    fs::permissions(folder, fs::perms::owner_all, ignored);
    return folder;
}

}  // namespace

void keepToolkitFilesIn(const Folder& folder) {
    const fs::path files = folder.toolkit();
    setenv("XDG_CONFIG_HOME", privateFolder(files / "config").c_str(), 1);
    setenv("XDG_CACHE_HOME", privateFolder(files / "cache").c_str(), 1);
    setenv("ELM_CONFIG_DIR_XDG", "1", 1);
    // A good one is kept: the display's socket is in it.
    if (!isUsableRunFolder(std::getenv("XDG_RUNTIME_DIR")))
        setenv("XDG_RUNTIME_DIR", privateFolder(files / "run").c_str(), 1);
}

}  // namespace device
