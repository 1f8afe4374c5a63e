#include "Commands.h"
#include "FolderLock.h"
#include "Output.h"
#include "Sender.h"

#include <iostream>

namespace tool {

namespace {

constexpr char about[] =
    R"(An application that runs has the request handed over and comes to the front; another one is started, as by
'kest-device start'. KEY=VALUE words are the request's extras; they pass through no shell. The command returns when the
screen has settled. An application that ends with status 0 because it was asked to, has done what it was asked.

Without --headless it opens a window, but where the application in front draws into memory, this one does too.
'kest-device launches' lists what was asked for.

Examples:
  kest-device launch com.ravella.kest
  kest-device launch com.ravella.kest appID=com.ravella.clock page=2
  kest-device launch com.ravella.kest LaunchingType=addNoti --headless)";

struct Options {
    std::vector<std::string> request;
    bool headless = false;
    bool json = false;
};

void tell(const LaunchRequest& request, const Launched& launched, const device::Folder& folder, bool json) {
    const bool isNew = launched.outcome == device::LaunchOutcome::Started;
    if (json) {
        print({{"application", request.appId},
               {"process", launched.process ? Json(launched.process->id()) : Json()},
               {"outcome", device::Launches::nameOf(launched.outcome)},
               {"folder", folder.root().string()}});
    } else if (!launched.process) {
        std::cout << request.appId << (isNew ? " was started" : " has the request") << " and ended by itself\n";
    } else {
        std::cout << request.appId << (isNew ? " runs" : " has the request") << (launched.headless ? ", headless" : "")
                  << " (process " << launched.process->id() << ")\n";
    }
}

void launch(Session& session, const Options& options) {
    LaunchRequest request = requestOf(options.request);
    request.headless = options.headless;
    session.folder().create();
    const FolderLock lock(session.folder());
    tell(request, send(session, request), session.folder(), options.json);
}

}  // namespace

void addLaunch(CLI::App& app, Session& session) {
    CLI::App* command = app.add_subcommand("launch", "Ask an application for something, and start it if need be");
    const auto options = std::make_shared<Options>();
    command->add_option("request", options->request, "The application, and the extras of its launch request")
        ->type_name("APPID [KEY=VALUE...]")
        ->required();
    command->add_flag("--headless", options->headless, "Draw into memory: no window, no display needed");
    addJsonOption(*command, options->json);
    command->footer(about);
    command->callback([options, &session] { launch(session, *options); });
}

}  // namespace tool
