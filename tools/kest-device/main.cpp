#include "HelpFormatter.h"
#include "Output.h"
#include "Session.h"
#include "commands/Commands.h"
#include "device/Error.h"

#include <csignal>
#include <iostream>
#include <string>

#include <poll.h>
#include <unistd.h>

namespace {

constexpr int failed = 1;
constexpr int wrongUsage = 2;

constexpr char about[] =
    "Runs and controls a device on this workstation: its applications, settings, packages, log and\n"
    "screen. A device is a folder: $KEST_DEVICE, else kest-device in the user's state folder.";

constexpr char examples[] = R"(Examples:
  kest-device start --headless            start Tips without a display
  kest-device set language ko_KR          change the display language
  kest-device tap --text "Wi-Fi"          touch a text on the screen
  kest-device screenshot list.png         save what the screen shows
  kest-device stop                        end everything that runs on the device

Exit status: 0 when it was done, 1 when it could not be done, 2 when the command line is wrong.)";

int sayError(const std::string& message, int status) {
    std::string line = message;
    for (char& character : line) {
        if (character == '\n' || character == '\r') {
            character = ' ';
        }
    }
    while (line.ends_with(' ')) {
        line.pop_back();
    }
    std::cerr << "kest-device: error: " << line << '\n';
    return status;
}

void describe(CLI::App& app, tool::Session& session) {
    app.name("kest-device");
    app.set_version_flag("--version", "kest-device " PROJECT_VERSION, "Print the version and end");
    app.set_help_flag("-h,--help", "Print this help and end");
    app.require_subcommand(1);
    app.formatter(std::make_shared<tool::HelpFormatter>());
    app.get_formatter()->column_width(26);
    for (const auto add :
         {tool::addStart,         tool::addLaunch,  tool::addStop,        tool::addStatus,  tool::addReset,
          tool::addGet,           tool::addSet,     tool::addUnset,       tool::addInstall, tool::addUninstall,
          tool::addPackages,      tool::addClear,   tool::addPreferences, tool::addUsage,   tool::addLaunches,
          tool::addNotifications, tool::addLog,     tool::addTree,        tool::addTap,     tool::addSwipe,
          tool::addKey,           tool::addWaitFor, tool::addScreenshot}) {
        add(app, session);
    }
    for (CLI::App* command : app.get_subcommands({})) {
        command->group("Commands");
    }
    // Last: a command takes over what the tool has when it is added.
    app.footer(examples);
}

/// The bus carries no other text, and a command line can hold anything.
bool isUtf8(const char* text) {
    try {
        tool::Json(text).dump();
        return true;
    } catch (const tool::Json::type_error&) {
        return false;
    }
}

/// What is wrong with the command line, in the words of this tool.
std::string mistake(const CLI::App& app, const CLI::ParseError& error, int argc, char** argv) {
    if (!app.get_subcommands().empty()) {
        return error.what();
    }
    for (int i = 1; i < argc; ++i) {
        if (argv[i][0] != '-') {
            return "there is no command \"" + std::string(argv[i]) + '"';
        }
    }
    return argc > 1 ? error.what() : "a command is missing";
}

/// Ends as a command does whose output nobody reads on, as in `kest-device tree | head`. The bus's library has the
/// process go on in that case.
void endWithItsReader() {
    pollfd output{STDOUT_FILENO, POLLOUT, 0};
    if (poll(&output, 1, 0) == 1 && (output.revents & POLLERR) != 0) {
        std::signal(SIGPIPE, SIG_DFL);
        std::raise(SIGPIPE);
    }
}

/// The command whose help explains the mistake.
std::string helpCommand(const CLI::App& app) {
    const auto commands = app.get_subcommands();
    return "kest-device " + (commands.empty() ? "" : commands.front()->get_name() + " ") + "--help";
}

int run(int argc, char** argv) {
    for (int i = 1; i < argc; ++i) {
        if (!isUtf8(argv[i])) {
            return sayError("argument " + std::to_string(i) + " is not UTF-8", wrongUsage);
        }
    }
    tool::Session session;
    CLI::App app(about);
    describe(app, session);
    try {
        app.parse(argc, argv);
    } catch (const CLI::Success& request) {
        return app.exit(request);
    } catch (const CLI::ParseError& error) {
        return sayError(mistake(app, error, argc, argv) + "; see '" + helpCommand(app) + "'", wrongUsage);
    } catch (const tool::UsageError& error) {
        return sayError(std::string(error.what()) + "; see '" + helpCommand(app) + "'", wrongUsage);
    }
    if (!std::cout.flush()) {
        endWithItsReader();
        return sayError("cannot write the output; is the disk full?", failed);
    }
    return 0;
}

}  // namespace

int main(int argc, char** argv) {
    try {
        return run(argc, argv);
    } catch (const std::exception& error) {
        return sayError(error.what(), failed);
    }
}
