#include "SampleWindow.h"

#include "device/ApplicationLock.h"
#include "device/Bus.h"
#include "device/BusName.h"
#include "device/Device.h"
#include "device/Keys.h"
#include "remote-control/Server.h"

#include <Ecore.h>
#include <Efreet.h>

#include <chrono>
#include <cstdio>
#include <cstdlib>
#include <stdexcept>
#include <string>
#include <thread>
#include <unistd.h>

namespace {

std::string titleFor(device::Device& device) {
    return "Fruits " + device.language();
}

/// What the application is told to do amiss, by a word "mode=...".
std::string modeOf(int argc, char** argv) {
    for (int i = 1; i < argc; ++i) {
        const std::string word = argv[i];
        if (word.starts_with("mode=")) {
            return word.substr(5);
        }
    }
    return {};
}

/// Shows the title that a later request gives, or does amiss what that says.
void take(const remote_control::Server::Extras& extras, const sample::SampleWindow& screen) {
    for (const auto& [key, value] : extras) {
        if (key == "title") {
            screen.setTitle(value);
        }
        if (key == "mode" && value == "ends") {
            elm_exit();
        }
    }
}

int run(const std::string& mode) {
    if (mode == "ends") {
        return 0;
    }
    if (mode == "fails") {
        std::fputs("something to begin with\nthe fruits are rotten\n", stderr);
        return 3;
    }
    if (mode == "crashes") {
        std::abort();
    }
    device::Device& device = device::Device::current();
    const device::ApplicationLock lock(device.folder(), device.application().id);
    if (mode == "slow") {
        std::this_thread::sleep_for(std::chrono::seconds(2));
    }
    Evas_Object* window = elm_win_add(nullptr, "sample", ELM_WIN_BASIC);
    if (!window) {
        throw std::runtime_error("no window");
    }
    elm_win_title_set(window, "Sample");
    elm_win_autodel_set(window, EINA_TRUE);
    elm_policy_set(ELM_POLICY_QUIT, ELM_POLICY_QUIT_LAST_WINDOW_CLOSED);
    sample::SampleWindow screen(window, titleFor(device), mode == "talkative");
    evas_object_resize(window, device.screen().width, device.screen().height);
    evas_object_show(window);

    const std::unique_ptr<device::Bus> bus = device::Bus::connect(device.folder());
    if (!bus) {
        throw std::runtime_error("no bus");
    }
    device.events().connect(*bus);
    const auto quit = [&mode] {
        if (mode != "deaf") {
            elm_exit();
        }
    };
    const auto launch = [&screen](const remote_control::Server::Extras& extras) { take(extras, screen); };
    const remote_control::Server server(*bus, device.application().id, {[window] { return window; }, quit, launch});
    device::BusName::own(*bus, device.application().id, false);
    device::BusName::own(*bus, device::bus::deviceName, true);
    const auto subscription = device.events().onSetting([&](const std::string& key) {
        if (key == device::keys::language) {
            screen.setTitle(titleFor(device));
        }
    });
    elm_run();
    device.events().disconnect();
    return 0;
}

}  // namespace

int main(int argc, char** argv) {
    if (chdir("/") != 0) {
        return 1;
    }
    try {
        const std::string mode = modeOf(argc, argv);
        ecore_app_no_system_modules();
        efreet_cache_disable();
        // Before EFL: what it writes for itself goes to the device's folder.
        const std::string home = device::Device::current().folder().toolkit();
        setenv("HOME", home.c_str(), 1);
        setenv("XDG_RUNTIME_DIR", home.c_str(), 1);
        elm_init(argc, argv);
        elm_config_profile_set("mobile");
        const int status = run(mode);
        device::Device::setCurrent(nullptr);
        elm_shutdown();
        return status;
    } catch (const std::exception& error) {
        std::fprintf(stderr, "sample: %s\n", error.what());
        return 1;
    }
}
