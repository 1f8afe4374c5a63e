#include "Commands.h"
#include "FolderLock.h"
#include "Output.h"
#include "Sender.h"
#include "device/Error.h"
#include "device/LaunchRequest.h"
#include "notifier/NotificationAppearance.h"

#include <iostream>

namespace tool {

namespace {

constexpr char about[] =
    R"(Without COMMAND, one notification a line, the newest last: its number, its time, who posted it, which application a
click launches and with which extras, and its title and text as the device shows them in its language.

They stay on the device until they are opened: by a click, where the desktop has a notification daemon that shows them,
or by 'open'.

Examples:
  kest-device notifications
  kest-device notifications --json
  kest-device notifications open 1
  kest-device notifications clear)";

constexpr char openAbout[] =
    R"(Does what a click on the notification does: sends the launch request that it carries, to the running application
or to one that it starts, and takes the notification off the device and off the desktop. Comes back when the
application's screen has settled. A notification whose application cannot be launched stays. Where the application in
front draws into memory, one that is started does too.

Example:
  kest-device notifications open 1 --headless)";

constexpr char clearAbout[] = R"(Takes all of them off the device and off the desktop; none is opened.

Example:
  kest-device notifications clear)";

struct Options {
    bool json = false;
    long long id = 0;
    bool headless = false;
};

/// "com.example.app key=value"
std::string wordsOf(const device::Notification& notification) {
    if (notification.launchAppId.empty()) {
        return "-";
    }
    std::string words = oneLine(notification.launchAppId);
    for (const auto& [key, value] : notification.launchExtras) {
        words += " " + oneLine(key) + "=" + oneLine(value);
    }
    return words;
}

Json launchOf(const device::Notification& notification) {
    if (notification.launchAppId.empty()) {
        return nullptr;
    }
    Json extras = Json::object();
    for (const auto& [key, value] : notification.launchExtras) {
        extras[key] = value;
    }
    return {{"application", notification.launchAppId}, {"extras", std::move(extras)}};
}

void list(device::Device& device, bool json) {
    Json all = Json::array();
    std::vector<std::vector<std::string>> rows;
    for (const device::Notification& notification : device.notifications().all()) {
        const NotificationAppearance seen = NotificationAppearance::of(device, notification);
        all.push_back({{"id", notification.id},
                       {"time", notification.time},
                       {"application", notification.appId},
                       {"launch", launchOf(notification)},
                       {"title", seen.title},
                       {"text", seen.content},
                       {"icon", seen.icon}});
        rows.push_back({std::to_string(notification.id), notification.time, oneLine(notification.appId),
                        wordsOf(notification), seen.title.empty() ? "-" : oneLine(seen.title), oneLine(seen.content)});
    }
    json ? print(all) : printTable(rows);
}

device::Error unknown(device::Device& device, long long id) {
    std::string there;
    for (const device::Notification& notification : device.notifications().all()) {
        there += (there.empty() ? "" : ", ") + std::to_string(notification.id);
    }
    return device::Error("there is no notification " + std::to_string(id) + "; " +
                         (there.empty() ? "the device has none" : "the device has " + there));
}

void open(Session& session, const Options& options) {
    session.folder().create();
    const FolderLock lock(session.folder());
    device::Device& device = session.device();
    const std::optional<device::Notification> notification = device.notifications().find(options.id);
    if (!notification) {
        throw unknown(device, options.id);
    }
    if (notification->launchAppId.empty()) {
        throw device::Error("notification " + std::to_string(options.id) + " opens nothing: it has no launch request");
    }
    const LaunchRequest request{notification->launchAppId, notification->launchExtras, options.headless};
    if (const std::string fault = device::faultOf({"", request.appId, request.extras}); !fault.empty()) {
        throw device::Error("notification " + std::to_string(options.id) + " cannot be opened: " + fault);
    }
    const Launched launched = send(session, request);
    device.presenter().takeDown(options.id);
    device.notifications().remove(options.id);
    std::cout << "opened notification " << options.id << ": " << request.appId
              << (launched.process ? " (process " + std::to_string(launched.process->id()) + ")" : " ended by itself")
              << '\n';
}

void clear(device::Device& device) {
    device.presenter().takeAllDown();
    device.notifications().removeAll();
}

}  // namespace

void addNotifications(CLI::App& app, Session& session) {
    CLI::App* command = app.add_subcommand("notifications", "List, open or clear the notifications on the device");
    const auto options = std::make_shared<Options>();
    addJsonOption(*command, options->json);
    command->callback([command, options, &session] {
        if (command->get_subcommands().empty()) {
            list(session.device(), options->json);
        }
    });

    CLI::App* opening = command->add_subcommand("open", "Open a notification, as a click on it does");
    opening->add_option("number", options->id, "The notification")->type_name("NUMBER")->required();
    opening->add_flag("--headless", options->headless, "Where the application has to be started: draw into memory");
    opening->footer(openAbout);
    opening->callback([options, &session] { open(session, *options); });

    CLI::App* clearing = command->add_subcommand("clear", "Take all notifications off the device");
    clearing->footer(clearAbout);
    clearing->callback([&session] { clear(session.device()); });

    command->footer(about);
    command->require_subcommand(0, 1);
}

}  // namespace tool
