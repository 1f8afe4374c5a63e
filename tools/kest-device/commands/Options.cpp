#include "Commands.h"

namespace tool {

void addJsonOption(CLI::App& command, bool& json) {
    command.add_flag("--json", json, "Print JSON, for programs");
}

void addAppOption(CLI::App& command, std::string& appId) {
    command.add_option("--app", appId, "Not the application in front, but this one")->type_name("APPID");
}

}  // namespace tool
