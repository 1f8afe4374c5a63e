#include "DesktopNotification.h"
#include "FolderWatch.h"
#include "device/Bus.h"
#include "device/Device.h"
#include "device/Error.h"
#include "device/ToolkitFiles.h"

#include <Ecore.h>

#include <cstdio>
#include <cstdlib>
#include <exception>
#include <filesystem>
#include <memory>
#include <optional>
#include <string>

namespace {

constexpr int wrongUse = 2;

/// A process that is asked to end takes down first what it shows.
Eina_Bool onAskedToEnd(void* shown, int, void*) {
    static_cast<DesktopNotification*>(shown)->takeDown();
    return ECORE_CALLBACK_DONE;
}

void waitForTheEndOf(device::Device& device, device::Bus& bus, const device::Notification& notification) {
    device.events().connect(bus);
    DesktopNotification shown(device, bus, notification, ecore_main_loop_quit);
    bus.onLost([&shown] { shown.busHasGone(); });
    const FolderWatch watch(device.folder().root(), [&shown] { shown.takeDown(); });
    Ecore_Event_Handler* handler = ecore_event_handler_add(ECORE_EVENT_SIGNAL_EXIT, onAskedToEnd, &shown);
    ecore_main_loop_begin();
    ecore_event_handler_del(handler);
}

void show(device::Device& device, long long id) {
    const auto stays = [&](const std::string& why) {
        DesktopNotification::log(device, device::Log::Level::Warning, id, "not shown on the desktop: " + why);
    };
    const std::optional<device::Notification> notification = device.notifications().find(id);
    if (!notification)
        return;
    // The bus is reached through EFL, which would keep files in the user's home.
    device::keepToolkitFilesIn(device.folder());
    const std::unique_ptr<device::Bus> bus = device::Bus::connect(device.folder());
    if (!bus)
        return stays("there is no bus");
    // Nobody is started on it: a daemon would belong to the device then, and end with it.
    if (bus->isPrivate() && !DesktopNotification::hasDaemon(*bus))
        return stays("there is no notification daemon on the device's own bus");
    waitForTheEndOf(device, *bus, *notification);
}

int fail(const device::Folder& folder, const char* words) {
    device::Log(folder.log()).write(device::Log::Level::Error, "NOTIFICATION", words);
    return EXIT_FAILURE;
}

}  // namespace

/// Shows one notification of a device on the desktop and waits for its click. Started by the device, which waits for
/// nothing: a click may come when whoever posted it has long ended.
int main(int argc, char** argv) try {
    char* end = nullptr;
    const long long id = argc == 3 ? std::strtoll(argv[2], &end, 10) : 0;
    if (id <= 0 || *end != '\0') {
        std::fprintf(stderr, "usage: %s FOLDER NUMBER, of a device and of one of its notifications\n", argv[0]);
        return wrongUse;
    }
    device::Device::Options options = device::Device::Options::standard();
    options.folder = device::Folder(argv[1]);
    // A device that has been removed meanwhile is not made anew.
    if (!std::filesystem::exists(options.folder.database()))
        return EXIT_SUCCESS;
    try {
        device::Device device(options);
        show(device, id);
    } catch (const device::Error& failure) {
        return fail(options.folder, failure.what());
    }
    return EXIT_SUCCESS;
} catch (const std::exception& failure) {
    std::fprintf(stderr, "%s\n", failure.what());
    return EXIT_FAILURE;
}
