#pragma once

#include <filesystem>

namespace test_ui {

/// A home directory of the test's own, with everything that EFL keeps in one, named by the environment. Removed
/// again at the end.
class TemporaryHome {
public:
    TemporaryHome();
    ~TemporaryHome();
    TemporaryHome(const TemporaryHome&) = delete;
    TemporaryHome& operator=(const TemporaryHome&) = delete;

    const std::filesystem::path& path() const { return path_; }

private:
    std::filesystem::path path_;
};

}  // namespace test_ui
