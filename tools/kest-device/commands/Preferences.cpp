#include "Applications.h"
#include "Commands.h"
#include "Output.h"
#include "device/Error.h"

#include <algorithm>

namespace tool {

namespace {

constexpr char clearAbout[] =
    R"(The application starts anew: what it had stored, caches included, is gone. Authors of tips see their changes
at the next start.

Example:
  kest-device clear com.ravella.kest)";

constexpr char preferencesAbout[] =
    R"(One value a line: the application, the key, the value. Kest keeps in them what it has read of each tip.

Examples:
  kest-device preferences
  kest-device preferences com.ravella.kest --json)";

void requireKnown(device::Device& device, const std::string& id) {
    requireApplicationId(id);
    const std::vector<std::string> applications = device.preferences().applications();
    const bool hasStored = std::find(applications.begin(), applications.end(), id) != applications.end();
    if (!hasStored && !device.packages().rootOf(id)) {
        throw device::Error(id + " is not installed and has stored nothing; 'kest-device packages' lists what is");
    }
}

void list(device::Device& device, const std::string& only, bool json) {
    std::vector<std::string> ids = device.preferences().applications();
    if (!only.empty()) {
        requireKnown(device, only);
        ids = {only};
    }
    Json all = Json::object();
    std::vector<std::vector<std::string>> rows;
    for (const std::string& id : ids) {
        all[id] = Json::object();
        for (const auto& [key, value] : device.preferences().all(id)) {
            all[id][key] = value;
            rows.push_back({id, oneLine(key), oneLine(value)});
        }
    }
    json ? print(all) : printTable(rows);
}

}  // namespace

void addClear(CLI::App& app, Session& session) {
    CLI::App* command = app.add_subcommand("clear", "Clear the preferences of an application");
    const auto id = std::make_shared<std::string>();
    command->add_option("appid", *id, "The application")->type_name("APPID")->required();
    command->footer(clearAbout);
    command->callback([id, &session] {
        requireKnown(session.device(), *id);
        session.device().preferences().clear(*id);
    });
}

void addPreferences(CLI::App& app, Session& session) {
    CLI::App* command = app.add_subcommand("preferences", "List what applications have stored");
    const auto id = std::make_shared<std::string>();
    const auto json = std::make_shared<bool>(false);
    command->add_option("appid", *id, "Only this application")->type_name("APPID");
    addJsonOption(*command, *json);
    command->footer(preferencesAbout);
    command->callback([id, json, &session] { list(session.device(), *id, *json); });
}

}  // namespace tool
