#include "Commands.h"
#include "FolderLock.h"
#include "Notifiers.h"
#include "PrivateBus.h"
#include "device/ApplicationLock.h"
#include "device/Error.h"

#include <iostream>

namespace tool {

namespace {

namespace fs = std::filesystem;

constexpr char about[] =
    R"(Removes the device's database, log and installed packages, and what applications wrote to their standard output,
and makes a fresh device in the same folder.
Other files in the folder, also a damaged database that was set aside, stay. Refuses while an application runs.

Example:
  kest-device stop && kest-device reset)";

void requireNothingRuns(const device::Folder& folder) {
    for (const std::string& id : device::ApplicationLock::applications(folder)) {
        if (device::ApplicationLock::holder(folder, id)) {
            throw device::Error(id + " runs on this device; end it with 'kest-device stop' first");
        }
    }
}

void removeAll(const fs::path& path, std::vector<std::string>& removed) {
    std::error_code error;
    if (fs::remove_all(path, error) > 0 && !error) {
        removed.push_back(path.filename());
    }
    if (error) {
        throw device::Error("cannot remove " + path.string() + ": " + error.message());
    }
}

/// Returns the names of what was there.
std::vector<std::string> removeContents(const device::Folder& folder) {
    std::vector<std::string> removed;
    for (const fs::path& path : {folder.database(), fs::path(folder.database().string() + "-wal"),
                                 fs::path(folder.database().string() + "-shm"), folder.log(),
                                 fs::path(folder.log().string() + ".1"), folder.outputs(), folder.toolkit()}) {
        removeAll(path, removed);
    }
    for (const std::string& id : device::Packages::removeInstalled(folder)) {
        removed.push_back(id);
    }
    return removed;
}

void reset(Session& session) {
    const device::Folder& folder = session.folder();
    folder.create();
    const FolderLock lock(folder);
    requireNothingRuns(folder);
    takeNotificationsDown(session);
    try {
        session.device();
    } catch (const device::DamagedError& damaged) {
        std::cout << damaged.what() << '\n';
    }
    session.close();
    std::vector<std::string> removed;
    {
        // An application that has come up meanwhile has its lock, or waits to open the database.
        const device::Database::Hold hold(folder);
        requireNothingRuns(folder);
        PrivateBus(folder).stop();
        removed = removeContents(folder);
    }
    session.device();
    std::cout << "the device " << folder.root().string() << " is as new; removed:";
    for (const std::string& name : removed) {
        std::cout << ' ' << name;
    }
    std::cout << '\n';
}

}  // namespace

void addReset(CLI::App& app, Session& session) {
    CLI::App* command = app.add_subcommand("reset", "Make the device as new");
    command->footer(about);
    command->callback([&session] { reset(session); });
}

}  // namespace tool
