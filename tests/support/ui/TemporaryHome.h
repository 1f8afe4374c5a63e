#pragma once

#include "support/Environment.h"
#include "support/TemporaryFolder.h"

#include <filesystem>
#include <list>

namespace test_ui {

/// A home directory of the test's own, with everything that EFL keeps in one, named by the environment. At the end it
/// is removed, and the environment is what it was.
class TemporaryHome {
public:
    TemporaryHome();

    const std::filesystem::path& path() const { return folder_.path(); }

private:
    support::TemporaryFolder folder_;
    std::list<support::Environment> environment_;
};

}  // namespace test_ui
