#pragma once

#include "device/MainLoop.h"
#include "support/Environment.h"
#include "support/Process.h"
#include "support/TemporaryFolder.h"

#include <Ecore.h>

#include <chrono>
#include <csignal>
#include <functional>
#include <memory>
#include <optional>
#include <poll.h>
#include <stdexcept>
#include <string>
#include <sys/socket.h>
#include <sys/un.h>

namespace support {

/// A child process that may use the main loop and the bus, whether or not the test has used them before.
inline Process processOnTheBus(const std::function<int()>& work) {
    return Process::ofWork([&work] {
        device::startMainLoop();
        ecore_fork_reset();
        return work();
    });
}

/// Runs the main loop until `done` says so; false when it did not within the time, which a passing test never needs.
inline bool runLoopUntil(const std::function<bool()>& done,
                         std::chrono::milliseconds patience = std::chrono::seconds(20)) {
    device::startMainLoop();
    // Ecore's own handler takes the ends of all child processes, also of those that a test waits for.
    std::signal(SIGCHLD, SIG_DFL);
    const auto end = std::chrono::steady_clock::now() + patience;
    // The loop may wait for something that never comes; it wakes up now and then to look at the time.
    Ecore_Timer* waking = ecore_timer_add(
        0.05, [](void*) -> Eina_Bool { return ECORE_CALLBACK_RENEW; }, nullptr);
    while (!done() && std::chrono::steady_clock::now() < end)
        ecore_main_loop_iterate_may_block(1);
    ecore_timer_del(waking);
    return done();
}

/// A D-Bus daemon of the test's own, on a socket in a temporary folder; this process's session bus meanwhile.
class PrivateBus {
public:
    /// `isSession`: whether DBUS_SESSION_BUS_ADDRESS names it; otherwise that is not set at all. `authentication`:
    /// EXTERNAL lets this user in, anything else refuses him. `services`: a folder of service files, by which the
    /// daemon starts programs, with this process's environment.
    explicit PrivateBus(bool isSession = true, const std::string& authentication = "EXTERNAL",
                        const std::string& services = "")
        : socket_((folder_.path() / "bus").string()),
          session_("DBUS_SESSION_BUS_ADDRESS", isSession ? std::optional(address()) : std::nullopt) {
        const std::string configuration = (folder_.path() / "bus.conf").string();
        writeFile(configuration, "<!DOCTYPE busconfig PUBLIC \"-//freedesktop//DTD D-Bus Bus Configuration 1.0//EN\" "
                                 "\"http://www.freedesktop.org/standards/dbus/1.0/busconfig.dtd\">\n"
                                 "<busconfig><type>session</type><listen>" +
                                     address() + "</listen><auth>" + authentication + "</auth>" +
                                     (services.empty() ? "" : "<servicedir>" + services + "</servicedir>") +
                                     "<policy context=\"default\">"
                                     "<allow send_destination=\"*\" eavesdrop=\"true\"/><allow eavesdrop=\"true\"/>"
                                     "<allow own=\"*\"/></policy></busconfig>\n");
        daemon_ = std::make_unique<Process>(
            Process::ofProgram({"dbus-daemon", "--nofork", "--nosyslog", "--config-file=" + configuration}));
        waitUntilItListens();
    }

    std::string address() const { return "unix:path=" + socket_; }
    /// Ends the daemon, as if it had crashed.
    void kill() { daemon_->end(SIGKILL); }
    /// Stops the daemon: it takes connections, but never answers.
    void stop() const { daemon_->signal(SIGSTOP); }

private:
    void waitUntilItListens() const {
        sockaddr_un name{};
        name.sun_family = AF_UNIX;
        if (socket_.size() >= sizeof name.sun_path)
            throw std::runtime_error(socket_ + ": too long for a socket");
        socket_.copy(name.sun_path, sizeof name.sun_path - 1);
        for (int attempt = 0; attempt < 4000; ++attempt) {
            const int probe = socket(AF_UNIX, SOCK_STREAM | SOCK_CLOEXEC, 0);
            const bool listens = connect(probe, reinterpret_cast<const sockaddr*>(&name), sizeof name) == 0;
            close(probe);
            if (listens)
                return;
            poll(nullptr, 0, 5);
        }
        throw std::runtime_error("dbus-daemon does not listen; is it installed?");
    }

    TemporaryFolder folder_;
    std::string socket_;
    Environment session_;
    std::unique_ptr<Process> daemon_;
};

}  // namespace support
