#include "TreeText.h"

#include "Applications.h"
#include "Commands.h"
#include "Output.h"

#include <iostream>

namespace tool {

namespace {

constexpr char about[] =
    R"(One line for each widget, list row and text: what it is, its place and size, the theme's group that draws it or the
part that it is in, a picture's file, the page that a pager is at, and PART=STATE for parts of the theme that look
otherwise than at first. What is out of sight stands in parentheses; lists also tell their rows that are not drawn.

Example:
  kest-device tree --json)";

struct Options {
    bool json = false;
    std::string appId;
};

void tree(Session& session, const Options& options) {
    const std::string id = theApplication(session, options.appId).id;
    const Json screen = Json::parse(callTo(session, id).text("Tree"));
    if (options.json) {
        print(screen);
    } else {
        std::cout << treeText(screen);
    }
}

}  // namespace

void addTree(CLI::App& app, Session& session) {
    CLI::App* command = app.add_subcommand("tree", "Print what is on the screen");
    const auto options = std::make_shared<Options>();
    addAppOption(*command, options->appId);
    addJsonOption(*command, options->json);
    command->footer(about);
    command->callback([options, &session] { tree(session, *options); });
}

}  // namespace tool
