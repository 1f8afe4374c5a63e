#pragma once

#include "Session.h"

#include <CLI/CLI.hpp>

namespace tool {

// One function a command, each in the file of its name. It gives `app` the command with its options, its help and
// what it does with the session; a failure is thrown.
void addStart(CLI::App& app, Session& session);
void addLaunch(CLI::App& app, Session& session);
void addStop(CLI::App& app, Session& session);
void addStatus(CLI::App& app, Session& session);
void addReset(CLI::App& app, Session& session);
void addGet(CLI::App& app, Session& session);
void addSet(CLI::App& app, Session& session);
void addUnset(CLI::App& app, Session& session);
void addInstall(CLI::App& app, Session& session);
void addUninstall(CLI::App& app, Session& session);
void addPackages(CLI::App& app, Session& session);
void addClear(CLI::App& app, Session& session);
void addPreferences(CLI::App& app, Session& session);
void addUsage(CLI::App& app, Session& session);
void addLaunches(CLI::App& app, Session& session);
void addNotifications(CLI::App& app, Session& session);
void addLog(CLI::App& app, Session& session);
void addTree(CLI::App& app, Session& session);
void addTap(CLI::App& app, Session& session);
void addSwipe(CLI::App& app, Session& session);
void addKey(CLI::App& app, Session& session);
void addWaitFor(CLI::App& app, Session& session);
void addScreenshot(CLI::App& app, Session& session);

/// Adds the option --json to a command that prints data.
void addJsonOption(CLI::App& command, bool& json);
/// Adds the option --app to a command about the screen.
void addAppOption(CLI::App& command, std::string& appId);

}  // namespace tool
