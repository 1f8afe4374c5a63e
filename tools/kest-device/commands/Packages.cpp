#include "Applications.h"
#include "Commands.h"
#include "Output.h"
#include "device/Error.h"

#include <iostream>

namespace tool {

namespace {

constexpr char installAbout[] =
    R"(DIR is laid out as a device has packages: tizen-manifest.xml, bin/, res/, shared/res/. An installed package of
the same id is updated. Running applications hear of it; the command returns when their screens have settled.
An application that is closed meanwhile learns of it only as far as it looks by itself at its next start.

Example:
  kest-device install packages/com.example.game)";

constexpr char uninstallAbout[] =
    R"(A package that every device has is hidden on this device only; 'kest-device reset' brings it back. Notifications of
the application go with it.

Example:
  kest-device uninstall com.example.game)";

constexpr char packagesAbout[] =
    R"(One package a line: its id, its version, whether it is preinstalled on every device or installed on this one,
and its name in the display language. --json tells its icon and its folder too.

Examples:
  kest-device packages
  kest-device packages --json)";

std::string nameOf(const device::Package& package) {
    return package.id + (package.version.empty() ? "" : " " + package.version);
}

void requireNotRunning(Session& session, const std::string& id) {
    for (const RunningApplication& application : runningApplications(session)) {
        if (application.id == id) {
            throw device::Error(id + " runs; end it with 'kest-device stop' first");
        }
    }
}

void install(Session& session, const std::string& source) {
    const std::string id = device::readManifest(std::filesystem::absolute(source)).id;
    requireNotRunning(session, id);
    device::Packages& packages = session.connectedDevice().packages();
    const bool updates = packages.rootOf(id).has_value();
    const device::Package package = packages.install(std::filesystem::absolute(source));
    settle(session);
    std::cout << (updates ? "updated " : "installed ") << nameOf(package) << '\n';
}

void uninstall(Session& session, const std::string& id) {
    requireApplicationId(id);
    requireNotRunning(session, id);
    device::Device& device = session.connectedDevice();
    device.packages().uninstall(id);
    for (const device::Notification& notification : device.notifications().all()) {
        if (notification.appId == id) {
            device.presenter().takeDown(notification.id);
            device.notifications().remove(notification.id);
        }
    }
    settle(session);
    std::cout << "uninstalled " << id << '\n';
}

void list(Session& session, bool json) {
    Json all = Json::array();
    std::vector<std::vector<std::string>> rows;
    const std::string language = session.device().language();
    for (const device::Package& package : session.device().packages().all()) {
        const std::string& label = package.labelIn(language);
        all.push_back({{"id", package.id},
                       {"version", package.version},
                       {"label", label},
                       {"preinstalled", package.preinstalled},
                       {"icon", package.icon},
                       {"root", package.root.string()}});
        rows.push_back({package.id, package.version.empty() ? "-" : package.version,
                        package.preinstalled ? "preinstalled" : "installed", oneLine(label)});
    }
    json ? print(all) : printTable(rows);
}

}  // namespace

void addInstall(CLI::App& app, Session& session) {
    CLI::App* command = app.add_subcommand("install", "Install a package on the device");
    const auto source = std::make_shared<std::string>();
    command->add_option("dir", *source, "The package's folder")->type_name("DIR")->required();
    command->footer(installAbout);
    command->callback([source, &session] {
        if (source->empty()) {
            throw UsageError("the package's folder has no name");
        }
        install(session, *source);
    });
}

void addUninstall(CLI::App& app, Session& session) {
    CLI::App* command = app.add_subcommand("uninstall", "Remove a package from the device");
    const auto id = std::make_shared<std::string>();
    command->add_option("appid", *id, "The package's id")->type_name("APPID")->required();
    command->footer(uninstallAbout);
    command->callback([id, &session] { uninstall(session, *id); });
}

void addPackages(CLI::App& app, Session& session) {
    CLI::App* command = app.add_subcommand("packages", "List the device's packages");
    const auto json = std::make_shared<bool>(false);
    addJsonOption(*command, *json);
    command->footer(packagesAbout);
    command->callback([json, &session] { list(session, *json); });
}

}  // namespace tool
