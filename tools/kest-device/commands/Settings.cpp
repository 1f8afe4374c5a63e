#include "Settings.h"

#include "Applications.h"
#include "Commands.h"
#include "Output.h"
#include "device/Error.h"

#include <iostream>

namespace tool {

namespace {

struct Options {
    std::string key;
    std::string value;
    bool json = false;
};

constexpr char getExamples[] = R"(KEY is language, country, theme or screen, or a vconf key, which holds a '/'.
Without KEY all settings are listed. A key that is not set is an error.

Examples:
  kest-device get
  kest-device get language
  kest-device get db/menu_widget/language --json)";

constexpr char setExamples[] =
    R"(KEY is language, country, theme or screen, or a vconf key, which holds a '/'; other keys than theirs take any value.
Running applications hear of the change; the command returns when their screens have settled.

language  one that the device's own texts exist in, such as ko_KR
country   two capital letters such as IN, or none. As a customisation reset does, it also clears the
          preferences of every application; an application follows when it loads anew, at the latest at
          its next start.
theme     light or dark
screen    720x1280 or 480x800; an application follows at its next start

Examples:
  kest-device set language ko_KR
  kest-device set country IN
  kest-device set db/setting/theme dark)";

constexpr char unsetExamples[] = R"(KEY is language, country, theme or screen, or a vconf key, which holds a '/'.
A key that a fresh device has not got is removed.
Without a country, preferences are cleared as by 'kest-device set country'.

Example:
  kest-device unset country)";

void get(Session& session, const Options& options) {
    if (options.key.empty()) {
        const auto settings = readSettings(session.device());
        if (options.json) {
            print(Json(settings));
            return;
        }
        std::vector<std::vector<std::string>> rows;
        rows.reserve(settings.size());
        for (const auto& [name, value] : settings) {
            rows.push_back({name, oneLine(value)});
        }
        printTable(rows);
        return;
    }
    const std::optional<std::string> value = readSetting(session.device(), options.key);
    if (!value) {
        throw device::Error(options.key + " is not set");
    }
    if (options.json) {
        print({{"key", options.key}, {"value", *value}});
    } else {
        std::cout << *value << '\n';
    }
}

}  // namespace

void addGet(CLI::App& app, Session& session) {
    CLI::App* command = app.add_subcommand("get", "Print a setting of the device, or all");
    const auto options = std::make_shared<Options>();
    command->add_option("key", options->key, "The setting")->type_name("KEY");
    addJsonOption(*command, options->json);
    command->footer(getExamples);
    command->callback([options, &session] { get(session, *options); });
}

void addSet(CLI::App& app, Session& session) {
    CLI::App* command = app.add_subcommand("set", "Change a setting of the device");
    const auto options = std::make_shared<Options>();
    command->add_option("key", options->key, "The setting")->type_name("KEY")->required();
    command->add_option("value", options->value, "Its new value")->type_name("VALUE")->required();
    command->footer(setExamples);
    command->callback([options, &session] {
        storeSetting(session.connectedDevice(), options->key, options->value);
        settle(session);
    });
}

void addUnset(CLI::App& app, Session& session) {
    CLI::App* command = app.add_subcommand("unset", "Give a setting what it has on a fresh device");
    const auto options = std::make_shared<Options>();
    command->add_option("key", options->key, "The setting")->type_name("KEY")->required();
    command->footer(unsetExamples);
    command->callback([options, &session] {
        removeSetting(session.connectedDevice(), options->key);
        settle(session);
    });
}

}  // namespace tool
