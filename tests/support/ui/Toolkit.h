#pragma once

#include "ui/EflLog.h"
#include "ui/TemporaryHome.h"

#include <optional>

namespace test_ui {

/// EFL as a test wants it: drawn into memory, on the test's own clock, with touch scrolling as on a device, in a
/// home of its own, and failing the test where EFL complains. One at a time.
class Toolkit {
public:
    Toolkit();
    /// Deletes the windows that are left and ends EFL.
    ~Toolkit();
    Toolkit(const Toolkit&) = delete;
    Toolkit& operator=(const Toolkit&) = delete;

    EflLog& log() { return *log_; }
    const TemporaryHome& home() const { return home_; }

private:
    TemporaryHome home_;
    std::optional<EflLog> log_;
};

}  // namespace test_ui
