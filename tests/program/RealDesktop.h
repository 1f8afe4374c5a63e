#pragma once

#include "support/PrivateBus.h"
#include "support/Process.h"
#include "support/TemporaryFolder.h"

#include <optional>
#include <string>

/// A desktop of the test's own: an X server without a screen, a window manager, without which EFL's windows stay empty,
/// a session bus, and dunst, a notification daemon that needs no more than these.
class RealDesktop {
public:
    /// The program that is missing for it; nullopt when all are installed.
    static std::optional<std::string> missing();

    /// Throws std::runtime_error when one of them does not start.
    RealDesktop();
    ~RealDesktop();
    RealDesktop(const RealDesktop&) = delete;
    RealDesktop& operator=(const RealDesktop&) = delete;

    const std::string& display() const { return display_; }
    std::string address() const { return session_.address(); }

    /// Whether a window of that class shows within ten seconds.
    bool showsWindow(const std::string& windowClass) const;
    /// Moves the mouse pointer onto the window and presses its left button.
    void clickWindow(const std::string& windowClass) const;

private:
    bool xdotool(const std::vector<std::string>& words) const;
    std::string startServer();

    support::TemporaryFolder folder_;
    support::PrivateBus session_;
    std::optional<support::Process> server_;
    std::string display_;
    std::optional<support::Process> windowManager_;
    std::optional<support::Process> daemon_;
};
