#include "ui/TemporaryHome.h"

#include <cstdlib>
#include <stdexcept>
#include <string>

namespace test_ui {

namespace fs = std::filesystem;

TemporaryHome::TemporaryHome() {
    std::string name = (fs::temp_directory_path() / "test-home-XXXXXX").string();
    if (!mkdtemp(name.data()))
        throw std::runtime_error("cannot make a temporary home: " + name);
    path_ = name;
    setenv("HOME", path_.c_str(), 1);
    for (const char* variable : {"XDG_CONFIG_HOME", "XDG_CACHE_HOME", "XDG_DATA_HOME", "XDG_RUNTIME_DIR"}) {
        const fs::path folder = path_ / variable;
        fs::create_directory(folder);
        fs::permissions(folder, fs::perms::owner_all);
        setenv(variable, folder.c_str(), 1);
    }
}

TemporaryHome::~TemporaryHome() {
    std::error_code ignored;
    fs::remove_all(path_, ignored);
}

}  // namespace test_ui
