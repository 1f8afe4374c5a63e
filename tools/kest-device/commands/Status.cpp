#include "Applications.h"
#include "Commands.h"
#include "Output.h"
#include "PrivateBus.h"
#include "Settings.h"

#include <cstdlib>

namespace tool {

namespace {

struct State {
    std::string folder;
    std::string bus;
    std::vector<RunningApplication> running;
    std::map<std::string, std::string> settings;
};

State stateOf(Session& session) {
    State state;
    state.folder = session.folder().root();
    state.settings = readSettings(session.device());
    if (session.bus()) {
        state.bus = PrivateBus(session.folder()).process() ? "private" : "session";
    }
    state.running = runningApplications(session);
    return state;
}

std::string settingOr(const State& state, const std::string& name, const std::string& otherwise) {
    const auto setting = state.settings.find(name);
    return setting == state.settings.end() ? otherwise : setting->second;
}

void printForPeople(const State& state) {
    std::vector<std::vector<std::string>> rows{{"folder", state.folder}};
    rows.push_back({"bus", state.bus.empty() ? "none" : state.bus});
    for (const RunningApplication& application : state.running) {
        rows.push_back({"running", application.id + " (process " + std::to_string(application.process.id()) + ")" +
                                       (application.onBus ? "" : ", does not answer")});
    }
    if (state.running.empty()) {
        rows.push_back({"running", "nothing"});
    }
    for (const char* name : {"language", "country", "theme", "screen"}) {
        rows.push_back({name, settingOr(state, name, "none")});
    }
    printTable(rows);
}

void printAsJson(const State& state) {
    Json json{{"folder", state.folder}};
    json["bus"] = state.bus.empty() ? Json() : Json(state.bus);
    json["applications"] = Json::array();
    for (const RunningApplication& application : state.running) {
        json["applications"].push_back(
            {{"id", application.id}, {"process", application.process.id()}, {"answers", application.onBus}});
    }
    for (const char* name : {"language", "country", "theme", "screen"}) {
        const std::string value = settingOr(state, name, "");
        json[name] = value.empty() ? Json() : Json(value);
    }
    print(json);
}

}  // namespace

void addStatus(CLI::App& app, Session& session) {
    CLI::App* command = app.add_subcommand("status", "Tell what the device is and what runs on it");
    const auto json = std::make_shared<bool>(false);
    addJsonOption(*command, *json);
    command->callback([json, &session] {
        const State state = stateOf(session);
        *json ? printAsJson(state) : printForPeople(state);
    });
}

}  // namespace tool
