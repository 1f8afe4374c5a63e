#include "DesktopNotification.h"

#include "NotifyCall.h"
#include "device/Bus.h"
#include "device/BusName.h"
#include "device/Device.h"
#include "device/Keys.h"

#include <exception>
#include <utility>

namespace {

constexpr char daemonName[] = "org.freedesktop.Notifications";
constexpr char daemonPath[] = "/org/freedesktop/Notifications";
/// Who asks for what a click asks for, in the device's record of launches.
constexpr char caller[] = "device-notifier";
constexpr char logTag[] = "NOTIFICATION";
constexpr double secondsBetweenLooks = 0.1;
/// Longer than the time within which a program that ends has failed to start.
constexpr int mostLooks = 110;

bool has(const Eldbus_Message* capabilities, const std::string& wanted) {
    Eldbus_Message_Iter* list = nullptr;
    if (!eldbus_message_arguments_get(capabilities, "as", &list))
        return false;
    for (const char* name = nullptr; eldbus_message_iter_get_and_next(list, 's', &name);)
        if (name == wanted)
            return true;
    return false;
}

/// The daemon's words, or null where it answered.
const char* errorOf(const Eldbus_Message* answer) {
    const char* name = nullptr;
    const char* words = nullptr;
    return eldbus_message_error_get(answer, &name, &words) ? (words && *words ? words : name) : nullptr;
}

}  // namespace

/// Nothing that is thrown reaches the toolkit; the notification ends instead of waiting for ever.
template <class Work>
void DesktopNotification::guarded(Work&& work) noexcept {
    if (isOver_)
        return;
    try {
        work();
    } catch (const std::exception& failure) {
        device_.log().write(device::Log::Level::Error, logTag, failure.what());
        end();
    }
}

DesktopNotification::DesktopNotification(device::Device& device, device::Bus& bus, device::Notification notification,
                                         std::function<void()> ended, std::chrono::milliseconds answerTime)
    : device_(device), bus_(bus), notification_(std::move(notification)), ended_(std::move(ended)),
      answerMilliseconds_(static_cast<double>(answerTime.count())),
      object_(eldbus_object_get(bus.connection(), daemonName, daemonPath)),
      proxy_(eldbus_proxy_get(object_, daemonName)),
      actions_(eldbus_proxy_signal_handler_add(proxy_, "ActionInvoked", onAction, this)),
      closings_(eldbus_proxy_signal_handler_add(proxy_, "NotificationClosed", onClosed, this)) {
    language_ = device_.events().onSetting([this](const std::string& key) {
        if (key == device::keys::language)
            guarded([this] { follow(); });
    });
    send(eldbus_proxy_method_call_new(proxy_, "GetCapabilities"), onCapabilities);
}

DesktopNotification::~DesktopNotification() {
    isOver_ = true;
    if (looking_)
        ecore_timer_del(looking_);
    if (watchesOwner_)
        eldbus_name_owner_changed_callback_del(bus_.connection(), daemonName, onOwner, this);
    if (pending_)
        eldbus_pending_cancel(pending_);
    eldbus_signal_handler_del(actions_);
    eldbus_signal_handler_del(closings_);
    eldbus_proxy_unref(proxy_);
    eldbus_object_unref(object_);
}

bool DesktopNotification::hasDaemon(const device::Bus& bus) {
    return device::BusName::owner(bus, daemonName).has_value();
}

void DesktopNotification::log(device::Device& device, device::Log::Level level, long long id, const std::string& line) {
    device.log().write(level, logTag, "notification " + std::to_string(id) + ": " + line);
}

void DesktopNotification::send(Eldbus_Message* call, Eldbus_Message_Cb answered) {
    pending_ = eldbus_proxy_send(proxy_, call, answered, this, answerMilliseconds_);
}

void DesktopNotification::onCapabilities(void* data, const Eldbus_Message* answer, Eldbus_Pending*) {
    auto* self = static_cast<DesktopNotification*>(data);
    self->pending_ = nullptr;
    self->guarded([&] {
        if (const char* error = errorOf(answer))
            return self->end(device::Log::Level::Warning, "not shown on the desktop: " + std::string(error));
        self->takesMarkup_ = has(answer, "body-markup");
        self->show();
    });
}

void DesktopNotification::show() {
    NotifyCall call;
    call.replaces = shown_;
    call.appId = notification_.appId;
    call.appearance = NotificationAppearance::of(device_, notification_);
    call.isClickable = !notification_.launchAppId.empty();
    call.asMarkup = takesMarkup_;
    Eldbus_Message* message = eldbus_proxy_method_call_new(proxy_, "Notify");
    call.appendTo(message);
    isAsking_ = true;
    isStale_ = false;
    send(message, onShown);
    // A text may be of any length.
    bus_.flushSoon();
}

void DesktopNotification::onShown(void* data, const Eldbus_Message* answer, Eldbus_Pending*) {
    auto* self = static_cast<DesktopNotification*>(data);
    self->pending_ = nullptr;
    self->guarded([&] {
        self->isAsking_ = false;
        if (const char* error = errorOf(answer))
            return self->end(device::Log::Level::Warning, "not shown on the desktop: " + std::string(error));
        if (!eldbus_message_arguments_get(answer, "u", &self->shown_) || self->shown_ == 0)
            return self->end(device::Log::Level::Warning, "not shown on the desktop: its daemon gave no number");
        if (!self->watchesOwner_) {
            self->watchesOwner_ = true;
            eldbus_name_owner_changed_callback_add(self->bus_.connection(), daemonName, onOwner, self, EINA_FALSE);
            log(self->device_, device::Log::Level::Info, self->notification_.id, "shown on the desktop");
        }
        if (self->isTakenDown_)
            self->close();
        else if (self->isStale_)
            self->show();
    });
}

/// The daemon replaces what it shows by the same in the new language.
void DesktopNotification::follow() {
    if (looking_ || isTakenDown_)
        return;
    if (isAsking_)
        isStale_ = true;
    else if (shown_ != 0)
        show();
}

void DesktopNotification::onAction(void* data, const Eldbus_Message* signal) {
    auto* self = static_cast<DesktopNotification*>(data);
    std::uint32_t shown = 0;
    const char* action = nullptr;
    if (eldbus_message_arguments_get(signal, "us", &shown, &action) && shown == self->shown_ && shown != 0 &&
        !self->looking_ && std::string(action) == NotifyCall::click)
        self->guarded([&] { self->open(); });
}

void DesktopNotification::open() {
    const device::Launcher::Result result =
        device_.launcher().launch({caller, notification_.launchAppId, notification_.launchExtras});
    if (result != device::Launcher::Result::Accepted)
        return end(device::Log::Level::Warning,
                   "clicked, but " + notification_.launchAppId + " cannot be launched; it stays on the device");
    device_.notifications().remove(notification_.id);
    log(device_, device::Log::Level::Info, notification_.id, "clicked");
    looking_ = ecore_timer_add(secondsBetweenLooks, onLook, this);
}

/// The device remembers what has come of a launch only while the main loop of whoever asked for it runs.
Eina_Bool DesktopNotification::onLook(void* data) noexcept {
    auto* self = static_cast<DesktopNotification*>(data);
    if (++self->looks_ < mostLooks && self->device_.launcher().isWaiting())
        return ECORE_CALLBACK_RENEW;
    self->looking_ = nullptr;
    self->end();
    return ECORE_CALLBACK_CANCEL;
}

void DesktopNotification::onClosed(void* data, const Eldbus_Message* signal) {
    auto* self = static_cast<DesktopNotification*>(data);
    std::uint32_t shown = 0;
    std::uint32_t reason = 0;
    if (eldbus_message_arguments_get(signal, "uu", &shown, &reason) && shown == self->shown_ && shown != 0 &&
        !self->looking_ && !self->isTakenDown_)
        self->guarded([&] { self->end(device::Log::Level::Info, "closed on the desktop; it stays on the device"); });
}

void DesktopNotification::onOwner(void* data, const char*, const char*, const char*) {
    auto* self = static_cast<DesktopNotification*>(data);
    if (!self->looking_)
        self->guarded(
            [&] { self->end(device::Log::Level::Info, "the desktop's daemon has ended; it stays on the device"); });
}

void DesktopNotification::takeDown() {
    guarded([this] {
        isTakenDown_ = true;
        if (isAsking_)
            return;
        if (shown_ == 0 || looking_)
            end();
        else
            close();
    });
}

void DesktopNotification::busHasGone() {
    guarded([this] {
        if (shown_ == 0)
            end(device::Log::Level::Warning, "not shown on the desktop: the bus has gone");
        else
            end(device::Log::Level::Info, "the bus has gone; it stays on the device");
    });
}

void DesktopNotification::close() {
    Eldbus_Message* call = eldbus_proxy_method_call_new(proxy_, "CloseNotification");
    eldbus_message_arguments_append(call, "u", shown_);
    send(call, onTakenDown);
}

void DesktopNotification::onTakenDown(void* data, const Eldbus_Message*, Eldbus_Pending*) {
    auto* self = static_cast<DesktopNotification*>(data);
    self->pending_ = nullptr;
    self->guarded([&] { self->end(device::Log::Level::Info, "taken off the desktop"); });
}

void DesktopNotification::end(device::Log::Level level, const std::string& line) {
    log(device_, level, notification_.id, line);
    end();
}

void DesktopNotification::end() {
    isOver_ = true;
    ended_();
}
