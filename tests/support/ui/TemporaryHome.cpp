#include "ui/TemporaryHome.h"

#include <cstdlib>

namespace test_ui {

namespace fs = std::filesystem;

TemporaryHome::TemporaryHome() {
    setenv("HOME", path().c_str(), 1);
    for (const char* name :
         {"XDG_CONFIG_HOME", "XDG_CACHE_HOME", "XDG_DATA_HOME", "XDG_STATE_HOME", "XDG_RUNTIME_DIR"}) {
        const fs::path folder = path() / name;
        fs::create_directory(folder);
        fs::permissions(folder, fs::perms::owner_all);
        setenv(name, folder.c_str(), 1);
    }
}

}  // namespace test_ui
