#pragma once

#include "device/Process.h"

#include <filesystem>
#include <utility>
#include <vector>

namespace device {

class Folder;
class Log;

/// Has the desktop show the device's notifications, each by a program of its own: it waits for the click, which may
/// come when whoever posted the notification has long ended.
/// Needs no database, so that a device whose database is damaged can be stopped.
class Presenter {
public:
    /// A notification that shows, or that its program tries to show.
    struct Shown {
        long long id = 0;
        Process process;
    };

    /// `program` takes the device's folder and a notification's number; empty: nobody shows them.
    Presenter(const Folder& folder, Log& log, std::filesystem::path program)
        : folder_(folder), log_(log), program_(std::move(program)) {}

    /// Starts the program and waits for nothing else. The notification is kept in any case, so that a failure is only
    /// a line in the log.
    void show(long long id);

    /// Those of this device, in the order of their numbers.
    std::vector<Shown> shown() const;
    /// Ends the program that shows it, if one does, which takes it off the desktop; it stays on the device.
    /// Throws Error when the program does not end.
    void takeDown(long long id) const;
    /// The same for all that show; returns which they were.
    std::vector<Shown> takeAllDown() const;

private:
    const Folder& folder_;
    Log& log_;
    std::filesystem::path program_;
};

}  // namespace device
