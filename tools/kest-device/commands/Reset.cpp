#include "Applications.h"
#include "Commands.h"
#include "FolderLock.h"
#include "PrivateBus.h"
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

void requireNothingRuns(Session& session) {
    for (const RunningApplication& application : runningApplications(session)) {
        throw device::Error(application.id + " runs on this device; end it with 'kest-device stop' first");
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

/// The folders of the packages only: what else lies there is not the device's.
void removePackages(const device::Folder& folder, std::vector<std::string>& removed) {
    std::error_code error;
    for (fs::directory_iterator entry(folder.apps(), error), end; !error && entry != end; entry.increment(error)) {
        if (fs::exists(entry->path() / "tizen-manifest.xml")) {
            removeAll(entry->path(), removed);
        }
    }
    std::error_code notEmpty;
    for (fs::path path = folder.apps(); path != folder.root(); path = path.parent_path()) {
        fs::remove(path, notEmpty);
    }
}

void reset(Session& session) {
    const device::Folder& folder = session.folder();
    folder.create();
    const FolderLock lock(folder);
    requireNothingRuns(session);
    try {
        session.device();
    } catch (const device::DamagedError& damaged) {
        std::cout << damaged.what() << '\n';
    }
    session.close();
    PrivateBus(folder).stop();

    std::vector<std::string> removed;
    for (const fs::path& path : {folder.database(), fs::path(folder.database().string() + "-wal"),
                                 fs::path(folder.database().string() + "-shm"), folder.log(),
                                 fs::path(folder.log().string() + ".1"), folder.outputs(), folder.toolkit()}) {
        removeAll(path, removed);
    }
    removePackages(folder, removed);
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
