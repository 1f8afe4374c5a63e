#include "Applications.h"
#include "Commands.h"
#include "Output.h"
#include "device/Keys.h"

namespace tool {

namespace {

constexpr char about[] =
    R"(The settings are those that the device uses: what was never set, or was unset, is as on a fresh device.
An application that is said not to answer runs without being on the device's bus; 'kest-device stop' ends it.

Examples:
  kest-device status
  kest-device status --json)";

struct State {
    std::string folder;
    std::string bus;
    std::vector<RunningApplication> running;
    std::string language;
    std::string country;
    std::string theme;
    std::string screen;
};

State stateOf(Session& session) {
    State state;
    state.folder = session.folder().root();
    device::Device& device = session.device();
    state.language = device.language();
    state.country = device.settings().get(device::keys::country).value_or("");
    state.theme = device.isDark() ? "dark" : "light";
    state.screen = device.screen().name;
    if (const device::Bus* bus = session.bus()) {
        state.bus = bus->isPrivate() ? "private" : "session";
    }
    state.running = runningApplications(session);
    return state;
}

void printForPeople(const State& state) {
    std::vector<std::vector<std::string>> rows{{"folder", state.folder}};
    rows.push_back({"bus", state.bus.empty() ? "none" : state.bus});
    for (const RunningApplication& application : state.running) {
        rows.push_back({"running", nameOf(application) + (application.onBus ? "" : ", does not answer")});
    }
    if (state.running.empty()) {
        rows.push_back({"running", "nothing"});
    }
    rows.push_back({"language", state.language});
    rows.push_back({"country", state.country.empty() ? "none" : state.country});
    rows.push_back({"theme", state.theme});
    rows.push_back({"screen", state.screen});
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
    json["language"] = state.language;
    json["country"] = state.country.empty() ? Json() : Json(state.country);
    json["theme"] = state.theme;
    json["screen"] = state.screen;
    print(json);
}

}  // namespace

void addStatus(CLI::App& app, Session& session) {
    CLI::App* command = app.add_subcommand("status", "Tell what the device is and what runs on it");
    const auto json = std::make_shared<bool>(false);
    addJsonOption(*command, *json);
    command->footer(about);
    command->callback([json, &session] {
        const State state = stateOf(session);
        *json ? printAsJson(state) : printForPeople(state);
    });
}

}  // namespace tool
