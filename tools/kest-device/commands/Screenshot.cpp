#include "Applications.h"
#include "Commands.h"

#include <filesystem>

namespace tool {

namespace {

constexpr char about[] =
    R"(The picture has the size of the device's display. An older file of that name is replaced once the new one is
whole.

Example:
  kest-device screenshot list.png)";

struct Options {
    std::string file;
    std::string appId;
};

}  // namespace

void addScreenshot(CLI::App& app, Session& session) {
    CLI::App* command = app.add_subcommand("screenshot", "Save what the screen shows as a PNG picture");
    const auto options = std::make_shared<Options>();
    command->add_option("file", options->file, "Where to save it")->type_name("FILE.png")->required();
    addAppOption(*command, options->appId);
    command->footer(about);
    command->callback([options, &session] {
        if (options->file.empty()) {
            throw UsageError("the picture's file has no name");
        }
        const std::string id = theApplication(session, options->appId).id;
        callTo(session, id).call("Screenshot", {std::filesystem::absolute(options->file).lexically_normal().string()});
    });
}

}  // namespace tool
