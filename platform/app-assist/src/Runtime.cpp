#include "Runtime.h"

#include "AppEvents.h"
#include "Guarded.h"
#include "UiTimers.h"

#include <app-assist/WWindow.h>
#include <device/Error.h>
#include <device/HandOver.h>
#include <device/Keys.h>
#include <device/StandardError.h>
#include <efl-answers/DisplayLanguage.h>
#include <uxt/Theme.h>

#include <Elementary.h>

#include <cstdio>
#include <cstdlib>
#include <stdexcept>
#include <string>

#include <errno.h>
#include <unistd.h>

namespace app_assist {

namespace {

/// The bus delivers what it has started the application for at once; a busy machine may take its time.
constexpr double secondsForRequest = 10;

void say(const std::string& line) {
    std::fprintf(stderr, "%s: %s\n", program_invocation_short_name, line.c_str());
}

/// "com.example.app" gives "app": the domain of the application's own texts.
std::string textDomain(const std::string& appId) {
    return appId.substr(appId.rfind('.') + 1);
}

bool isSet(const char* variable) {
    const char* value = std::getenv(variable);
    return value && *value;
}

void requireDisplay() {
    if (!isSet("DISPLAY") && !isSet("WAYLAND_DISPLAY") && !isSet("ELM_ENGINE"))
        throw device::Error("there is no display to show a window on (DISPLAY and WAYLAND_DISPLAY are not set); "
                            "ELM_ENGINE=buffer draws into memory");
}

}  // namespace

Runtime::~Runtime() {
    end();
}

std::optional<int> Runtime::begin(int argc, char** argv) {
    try {
        words_ = LaunchRequest::parse(argc, argv, [] { return device::Device::current().application().link; });
    } catch (const std::invalid_argument& error) {
        device::sayErrorOnce(error.what());
        return 2;
    } catch (const std::exception& error) {
        device::sayErrorOnce(error.what());
        return 1;
    }
    try {
        if (const auto status = claimInstance())
            return status;
        requireDisplay();
        startToolkit(argc, argv);
        if (!createApplication(argc, argv)) {
            device::sayErrorOnce("the application could not start");
            return 1;
        }
        if (const auto status = joinBus())
            return status;
        catchUp();
        words_.comesOverTheBus ? awaitRequest() : queueFirstRequest();
        return std::nullopt;
    } catch (const std::exception& error) {
        device::sayErrorOnce(error.what());
        return 1;
    }
}

void Runtime::startToolkit(int argc, char** argv) {
    const device::Application& application = device_->application();
    // Where a device's launcher starts applications; pictures in texts are named relative to it.
    if (chdir("/") != 0)
        throw device::Error("/: cannot change to this folder");
    DisplayLanguage::bindTexts(textDomain(application.id), application.root / "res/locale");
    DisplayLanguage::bindTexts("sys_string", device_->data() / "locale");
    toolkit_.emplace(*device_, messages_, argc, argv);
    // After EFL, which sets a locale of its own when it starts.
    useLanguage();
    useTheme();
    windowAhead_.emplace();
    if (!windowAhead_->exists())
        device::sayErrorOnce("no window could be made on the display");
}

bool Runtime::createApplication(int argc, char** argv) {
    followDevice();
    app_.onStart(argc, argv);
    created_ = app_.onCreate();
    return created_;
}

std::optional<int> Runtime::joinBus() {
    const auto launch = [this](const LaunchRequest::Extras& extras) { deliver(extras); };
    try {
        presence_.emplace(*device_, remote_control::Server::Application{[this] { return window(); }, [] { elm_exit(); },
                                                                        launch, device_->application().link});
        if (words_.comesOverTheBus)
            presence_->requireStartingBus();
    } catch (const device::Error& error) {
        if (words_.comesOverTheBus)
            throw;
        say(std::string(error.what()) + "; remote control is off");
        return std::nullopt;
    }
    switch (presence_->result()) {
    case BusPresence::Result::OtherDevice:
        device::sayErrorOnce("the bus belongs to the device in " + presence_->otherFolder() + ", not to the one in " +
                             device_->folder().root().string() + "; give each device a bus of its own");
        return 1;
    case BusPresence::Result::RunningAlready:
        presence_.reset();
        return handOver().value_or(1);
    case BusPresence::Result::NoBus:
        if (words_.comesOverTheBus)
            throw device::Error("there is no bus, so the launch request cannot come");
        say("there is no bus: remote control is off");
        return std::nullopt;
    case BusPresence::Result::Joined:
        return std::nullopt;
    }
    return std::nullopt;
}

std::optional<int> Runtime::claimInstance() {
    device_ = &device::Device::current();
    for (;;) {
        instance_.emplace(device_->folder(), device_->application().id);
        if (instance_->isHeld()) {
            if (!device_->database().isReplaced())
                return std::nullopt;
            // It was set aside before the lock told that an application uses it. A device is opened without the lock.
            instance_.reset();
            // The old one goes first, and there may be none then.
            device_ = nullptr;
            device_ = &device::Device::reopenCurrent();
        } else if (const auto status = handOver()) {
            return status;
        }
    }
}

std::optional<int> Runtime::handOver() {
    const std::string& id = device_->application().id;
    try {
        const bool taken = words_.comesOverTheBus ? device::waitOnStartingBus(device_->folder(), id)
                                                  : device::handOver(device_->folder(), id, words_.extras);
        if (!taken)
            return std::nullopt;
        say(id + " is running already");
        return 0;
    } catch (const device::Error& error) {
        device::sayErrorOnce(id + " is running already, but the launch request cannot be handed over: " + error.what());
        return 1;
    }
}

Evas_Object* Runtime::window() const {
    return app_.getWindow() ? app_.getWindow()->getEvasObj() : nullptr;
}

void Runtime::queueFirstRequest() {
    // From inside the main loop, so that it can end the application, and before the loop draws for the first time: the
    // first frame has what the request asked for, and no empty one is waited for. Nor has the loop read the bus then,
    // so that no request from there overtakes this one.
    firstRequest_ = ecore_idle_enterer_before_add(
        [](void* data) -> Eina_Bool {
            auto* self = static_cast<Runtime*>(data);
            self->firstRequest_ = nullptr;
            guarded("a launch request", [self] { self->deliver(self->words_.extras); });
            return ECORE_CALLBACK_CANCEL;
        },
        this);
}

void Runtime::awaitRequest() {
    patience_ = ecore_timer_add(
        secondsForRequest,
        [](void* data) -> Eina_Bool {
            static_cast<Runtime*>(data)->patience_ = nullptr;
            dlog_print(DLOG_WARN, logTag, "no launch request has come within %g s of the start by the bus; the end",
                       secondsForRequest);
            elm_exit();
            return ECORE_CALLBACK_CANCEL;
        },
        this);
}

void Runtime::deliver(const LaunchRequest::Extras& extras) {
    if (patience_)
        ecore_timer_del(std::exchange(patience_, nullptr));
    const LaunchRequest request(device_->application().id, extras);
    const bool first = std::exchange(firstLaunch_, false);
    app_.onAppControl(request.handle(), first);
    if (first)
        app_.beginSight();
    // Until the bus brings the request that it started the application for, another window may have come to the front.
    if (!first || words_.comesOverTheBus)
        raiseWindow();
}

void Runtime::raiseWindow() const {
    if (Evas_Object* raised = window()) {
        elm_win_iconified_set(raised, EINA_FALSE);
        elm_win_raise(raised);
        elm_win_activate(raised);
    }
}

void Runtime::followDevice() {
    settings_ = device_->events().onSetting(
        [this](const std::string& key) { guarded("a setting's change", [&] { settingChanged(key); }); });
}

void Runtime::settingChanged(const std::string& key) {
    if (key == device::keys::language) {
        useLanguage();
        AppEvents::dispatch(APP_EVENT_LANGUAGE_CHANGED);
    } else if (key == device::keys::theme) {
        useTheme();
        uxt::themeChanged();
    }
}

void Runtime::catchUp() {
    if (device_->language() != language_)
        settingChanged(device::keys::language);
    if (device_->isDark() != isDark_)
        settingChanged(device::keys::theme);
}

void Runtime::useLanguage() {
    language_ = device_->language();
    const DisplayLanguage language(language_);
    language.use();
    elm_config_mirrored_set(language.isRightToLeft());
}

void Runtime::useTheme() {
    isDark_ = device_->isDark();
    uxt::applyDeviceTheme(isDark_);
}

void Runtime::end() {
    if (firstRequest_)
        ecore_idle_enterer_del(std::exchange(firstRequest_, nullptr));
    if (patience_)
        ecore_timer_del(std::exchange(patience_, nullptr));
    app_.endSight();
    if (std::exchange(created_, false))
        guarded("onTerminate", [this] { app_.onTerminate(); });
    settings_.reset();
    presence_.reset();
    if (device_)
        device_->preferences().finish();
    instance_.reset();
    app_.window_.reset();
    UiTimers::endAll();
    windowAhead_.reset();
    toolkit_.reset();
    device_ = nullptr;
}

}  // namespace app_assist
