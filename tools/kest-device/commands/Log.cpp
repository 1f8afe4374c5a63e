#include "Commands.h"
#include "LogFile.h"
#include "LogLine.h"
#include "Output.h"

#include <iostream>
#include <thread>
#include <unistd.h>

namespace tool {

namespace {

using namespace std::chrono_literals;

constexpr auto pollInterval = 100ms;

constexpr char about[] =
    R"(One line a call: time, level, tag, process and message. The log begins anew at 4 MiB; the file before it is kept.
With --json each line is one JSON object. Colours appear on a terminal only.

Examples:
  kest-device log --tag KEST --level warning
  kest-device log -f)";

struct Options {
    bool follow = false;
    bool json = false;
    std::string level;
    std::string tag;
};

/// Prints the lines that are asked for.
class Printer {
public:
    explicit Printer(const Options& options)
        : json_(options.json), tag_(options.tag),
          least_(options.level.empty() ? 0 : logLevels.find(logLevelNamed(options.level))),
          colours_(isatty(STDOUT_FILENO) == 1) {}

    void operator()(const std::string& line) const {
        const std::optional<LogLine> parsed = LogLine::parse(line);
        if (!isWanted(parsed)) {
            return;
        }
        if (!json_) {
            std::cout << (colours_ ? line : withoutColours(line)) << '\n';
        } else if (parsed) {
            printOnOneLine({{"time", parsed->time},
                            {"level", std::string(1, parsed->level)},
                            {"tag", parsed->tag},
                            {"process", parsed->process},
                            {"message", withoutColours(parsed->message)}});
        } else {
            printOnOneLine({{"message", withoutColours(line)}});
        }
    }

private:
    /// What is no line of a log call has neither level nor tag.
    bool isWanted(const std::optional<LogLine>& line) const {
        if (!line) {
            return least_ == 0 && tag_.empty();
        }
        return logLevels.find(line->level) >= least_ && (tag_.empty() || line->tag == tag_);
    }

    bool json_;
    std::string tag_;
    std::size_t least_;
    bool colours_;
};

void log(Session& session, const Options& options) {
    const Printer print(options);
    LogFile(session.folder().log().string() + ".1").readNewLines(print);
    LogFile file(session.folder().log());
    file.readNewLines(print);
    while (options.follow && std::cout.flush()) {
        std::this_thread::sleep_for(pollInterval);
        file.readNewLines(print);
    }
}

}  // namespace

void addLog(CLI::App& app, Session& session) {
    CLI::App* command = app.add_subcommand("log", "Print the device's log");
    const auto options = std::make_shared<Options>();
    command->add_flag("-f,--follow", options->follow, "Go on with lines as they come");
    command->add_option("--level", options->level, "Only this level and what is more important")
        ->type_name("debug|info|warning|error|fatal");
    command->add_option("--tag", options->tag, "Only lines with this tag")->type_name("TAG");
    addJsonOption(*command, options->json);
    command->footer(about);
    command->callback([options, &session] { log(session, *options); });
}

}  // namespace tool
