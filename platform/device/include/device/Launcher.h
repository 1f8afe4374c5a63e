#pragma once

#include "device/Launches.h"
#include "device/Process.h"

#include <chrono>
#include <functional>
#include <string>
#include <utility>
#include <vector>

namespace device {

class Device;

/// Carries launch requests out and keeps, in Launches, what has come of each.
/// An application is started by its package's program. One that runs already is started once more: that process hands
/// the request over and ends. So whoever asks waits neither for the bus nor for the application, only for the program
/// to be loaded and, where another process is writing the database, a quarter of a second for that.
class Launcher {
public:
    enum class Result {
        Accepted,  ///< the program has the request; Launches tells what comes of it while this process's main loop runs
        NotFound,  ///< the application is not installed, or has no program
        Rejected,  ///< the extras cannot be handed over; see launch()
        Failed,    ///< the program cannot be started, or the manifest is broken
    };

    using Clock = std::function<std::chrono::steady_clock::time_point()>;

    /// `clock` tells how long a program took to fail.
    explicit Launcher(Device& device, Clock clock = std::chrono::steady_clock::now)
        : device_(device), clock_(std::move(clock)) {}
    ~Launcher();
    Launcher(const Launcher&) = delete;
    Launcher& operator=(const Launcher&) = delete;

    /// Extras are texts of UTF-8 whose names hold no '=', and are no longer than 64 KiB in all.
    /// What fails is a line in the device's log; a record that cannot be written does not keep the application from
    /// starting. Throws Error when the device cannot be read.
    Result launch(const LaunchRequest& request);

    /// Whether a program runs that it has started. What comes of a launch is known when that has ended, or after the
    /// 10 seconds within which an end is a failure to start.
    bool isWaiting();

private:
    /// A process that this one started for a request.
    struct Child {
        Process process;
        long long record;
        LaunchRequest request;
        bool again;
        std::chrono::steady_clock::time_point begin;
    };

    Result carryOut(const LaunchRequest& request);
    Result refuse(const LaunchRequest& request, Result result, const std::string& reason);
    bool runs(const LaunchRequest& request) const;
    /// 0 when it could not be written.
    long long record(const LaunchRequest& request, LaunchOutcome outcome, const std::string& reason);
    void update(const Child& child, LaunchOutcome outcome, const std::string& reason);
    void watchChildren();
    void reapChildren();
    void childEnded(int process, const std::string& how, bool well);

    static unsigned char whenChildEnds(void* launcher, int type, void* event) noexcept;

    Device& device_;
    Clock clock_;
    std::vector<Child> children_;
    void* endHandler_ = nullptr;
};

}  // namespace device
