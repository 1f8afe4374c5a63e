#include "Commands.h"
#include "Output.h"

namespace tool {

namespace {

constexpr char about[] =
    R"(One record a line, the oldest first: its number, its time, the URI that it was written to, and its values.
They stay until 'kest-device reset'.

Examples:
  kest-device usage
  kest-device usage --json
  kest-device wait-for usage=KT01)";

void list(device::Device& device, bool json) {
    Json all = Json::array();
    std::vector<std::vector<std::string>> rows;
    for (const device::UsageRecord& record : device.usage().all()) {
        Json values = Json::object();
        std::string words;
        for (const auto& [key, value] : record.values) {
            values[key] = value;
            words += (words.empty() ? "" : " ") + oneLine(key) + "=" + oneLine(value);
        }
        all.push_back({{"id", record.id}, {"time", record.time}, {"uri", record.uri}, {"values", std::move(values)}});
        rows.push_back({std::to_string(record.id), record.time, oneLine(record.uri), words});
    }
    json ? print(all) : printTable(rows);
}

}  // namespace

void addUsage(CLI::App& app, Session& session) {
    CLI::App* command = app.add_subcommand("usage", "List the usage records that applications have written");
    const auto json = std::make_shared<bool>(false);
    addJsonOption(*command, *json);
    command->footer(about);
    command->callback([json, &session] { list(session.device(), *json); });
}

}  // namespace tool
