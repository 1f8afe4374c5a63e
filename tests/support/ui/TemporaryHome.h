#pragma once

#include "support/TemporaryFolder.h"

#include <filesystem>

namespace test_ui {

/// A home directory of the test's own, with everything that EFL keeps in one, named by the environment. Removed
/// again at the end.
class TemporaryHome {
public:
    TemporaryHome();

    const std::filesystem::path& path() const { return folder_.path(); }

private:
    support::TemporaryFolder folder_;
};

}  // namespace test_ui
