#include "Commands.h"
#include "Output.h"

namespace tool {

namespace {

constexpr char about[] =
    R"(One launch request a line, the newest last: its number, its time, who asked, which application was asked for, with
which extras, and what has come of it. That is "started", "handed over" to an application that ran already, "failed"
with the reason, or "asked" while it is not known. They stay until 'kest-device reset'.

Examples:
  kest-device launches
  kest-device launches --json)";

void list(device::Device& device, bool json) {
    Json all = Json::array();
    std::vector<std::vector<std::string>> rows;
    for (const device::LaunchRecord& record : device.launches().all()) {
        Json extras = Json::object();
        std::string words;
        for (const auto& [key, value] : record.request.extras) {
            extras[key] = value;
            words += (words.empty() ? "" : " ") + oneLine(key) + "=" + oneLine(value);
        }
        const std::string outcome = device::Launches::nameOf(record.outcome);
        all.push_back({{"id", record.id},
                       {"time", record.time},
                       {"caller", record.request.caller},
                       {"application", record.request.appId},
                       {"extras", std::move(extras)},
                       {"outcome", outcome},
                       {"reason", record.reason}});
        rows.push_back({std::to_string(record.id), record.time, oneLine(record.request.caller),
                        record.request.appId.empty() ? "-" : oneLine(record.request.appId), words.empty() ? "-" : words,
                        outcome + (record.reason.empty() ? "" : ": " + oneLine(record.reason))});
    }
    json ? print(all) : printTable(rows);
}

}  // namespace

void addLaunches(CLI::App& app, Session& session) {
    CLI::App* command = app.add_subcommand("launches", "List the launch requests that applications have made");
    const auto json = std::make_shared<bool>(false);
    addJsonOption(*command, *json);
    command->footer(about);
    command->callback([json, &session] { list(session.device(), *json); });
}

}  // namespace tool
