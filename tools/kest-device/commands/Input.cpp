#include "Applications.h"
#include "Commands.h"
#include "device/Error.h"

#include <array>
#include <iostream>
#include <optional>

namespace tool {

namespace {

using namespace std::chrono_literals;

constexpr char tapAbout[] = R"(Touches a place, or the one text in sight that equals TEXT or, where none does, holds it.
Returns when the screen has settled.

Examples:
  kest-device tap 360 400
  kest-device tap --text "Wi-Fi")";

constexpr char swipeAbout[] = R"(Moves a finger from one place to another. Returns when the screen has settled.

Examples:
  kest-device swipe 360 1000 360 300              scroll a list
  kest-device swipe 600 640 100 640 --seconds 0.5)";

constexpr char keyAbout[] =
    R"(NAME is back, Escape, Return, Up, Down, Left, Right, Tab, space, BackSpace, Delete, Home, End, Prior, Next,
KP_Enter, XF86Back, a letter or a digit. Returns when the screen has settled.

Example:
  kest-device key Escape)";

struct Options {
    std::optional<int> x;
    std::optional<int> y;
    std::array<int, 4> places{};
    std::string text;
    double seconds = 0.15;
    std::string key;
    std::string appId;
};

/// Whether the application is about to end or has: it leaves the bus at once, and may then take a while.
bool ends(Session& session, const RunningApplication& application) {
    const auto deadline = std::chrono::steady_clock::now() + 1s;
    do {
        const std::optional<RunningApplication> stillThere = findApplication(session, application.id);
        if (!stillThere || !stillThere->onBus) {
            return application.process.endsWithin(20s);
        }
    } while (!application.process.endsWithin(20ms) && std::chrono::steady_clock::now() < deadline);
    return !application.process.runs();
}

/// Input that ends the application was carried out all the same.
void send(Session& session, const std::string& appId, const std::string& method,
          const device::BusCall::Arguments& arguments) {
    const RunningApplication application = theApplication(session, appId);
    try {
        callTo(session, application.id).call(method, arguments);
    } catch (const device::Error&) {
        if (!ends(session, application)) {
            throw;
        }
        std::cout << application.id << " ended\n";
    }
}

void tap(Session& session, const Options& options, bool byText) {
    if (byText == options.x.has_value() || options.x.has_value() != options.y.has_value()) {
        throw UsageError("tap needs either X and Y or --text");
    }
    if (byText) {
        send(session, options.appId, "TapText", {options.text});
    } else {
        send(session, options.appId, "Tap", {*options.x, *options.y});
    }
}

}  // namespace

void addTap(CLI::App& app, Session& session) {
    CLI::App* command = app.add_subcommand("tap", "Touch the screen");
    const auto options = std::make_shared<Options>();
    command->add_option("x", options->x, "The place, in pixels from the left")->type_name("X");
    command->add_option("y", options->y, "and from the top")->type_name("Y");
    const CLI::Option* text = command->add_option("--text", options->text, "A text in sight")->type_name("TEXT");
    addAppOption(*command, options->appId);
    command->footer(tapAbout);
    command->callback([options, text, &session] { tap(session, *options, text->count() > 0); });
}

void addSwipe(CLI::App& app, Session& session) {
    CLI::App* command = app.add_subcommand("swipe", "Move a finger over the screen");
    const auto options = std::make_shared<Options>();
    static constexpr std::array names{"x1", "y1", "x2", "y2"};
    static constexpr std::array labels{"X1", "Y1", "X2", "Y2"};
    static constexpr std::array meanings{"From, in pixels from the left", "and from the top", "To, from the left",
                                         "and from the top"};
    for (std::size_t i = 0; i < names.size(); ++i) {
        command->add_option(names[i], options->places[i], meanings[i])->type_name(labels[i])->required();
    }
    command->add_option("--seconds", options->seconds, "How long it takes")->type_name("S")->capture_default_str();
    addAppOption(*command, options->appId);
    command->footer(swipeAbout);
    command->callback([options, &session] {
        if (!(options->seconds >= 0.01 && options->seconds <= 10)) {
            throw UsageError("a swipe takes from 0.01 to 10 seconds");
        }
        const std::array<int, 4>& at = options->places;
        send(session, options->appId, "Swipe", {at[0], at[1], at[2], at[3], options->seconds});
    });
}

void addKey(CLI::App& app, Session& session) {
    CLI::App* command = app.add_subcommand("key", "Press and release a key");
    const auto options = std::make_shared<Options>();
    command->add_option("name", options->key, "The key")->type_name("NAME")->required();
    addAppOption(*command, options->appId);
    command->footer(keyAbout);
    command->callback([options, &session] { send(session, options->appId, "Key", {options->key}); });
}

}  // namespace tool
