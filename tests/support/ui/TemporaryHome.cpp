#include "ui/TemporaryHome.h"

namespace test_ui {

namespace fs = std::filesystem;

TemporaryHome::TemporaryHome() {
    environment_.emplace_back("HOME", path().string());
    for (const char* name :
         {"XDG_CONFIG_HOME", "XDG_CACHE_HOME", "XDG_DATA_HOME", "XDG_STATE_HOME", "XDG_RUNTIME_DIR"}) {
        const fs::path folder = path() / name;
        fs::create_directory(folder);
        fs::permissions(folder, fs::perms::owner_all);
        environment_.emplace_back(name, folder.string());
    }
}

}  // namespace test_ui
