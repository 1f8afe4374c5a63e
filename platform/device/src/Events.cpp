#include "device/Events.h"

#include "Utf8.h"
#include "device/Bus.h"

#include <Eldbus.h>

#include <algorithm>
#include <cstdint>
#include <cstdio>
#include <exception>
#include <string_view>
#include <utility>
#include <vector>

namespace device {
namespace {

constexpr char settingSignal[] = "SettingChanged";
constexpr char packageSignal[] = "PackageChanged";
constexpr std::size_t longestName = 64 * 1024;  // a larger message could stay half sent: see Bus::flushSoon()

/// The handlers of one kind of event, in the order in which they subscribed.
template <class... Values>
class Handlers : public std::enable_shared_from_this<Handlers<Values...>> {
public:
    using Handler = std::function<void(Values...)>;

    Events::Subscription add(Handler handler) {
        const auto entry = std::make_shared<Handler>(std::move(handler));
        entries_.push_back(entry);
        return Events::Subscription(entry.get(), [weak = this->weak_from_this()](void* handle) {
            if (const auto self = weak.lock())
                self->remove(handle);
        });
    }

    /// A handler may subscribe, unsubscribe itself or others, and publish.
    void call(Values... values) const {
        const auto current = entries_;
        for (const auto& entry : current)
            if (std::find(entries_.begin(), entries_.end(), entry) != entries_.end())
                callOne(*entry, values...);
    }

private:
    static void callOne(const Handler& handler, Values... values) {
        try {
            handler(values...);
        } catch (const std::exception& failure) {
            std::fprintf(stderr, "%s\n", failure.what());
        }
    }

    void remove(const void* handle) {
        entries_.erase(
            std::remove_if(entries_.begin(), entries_.end(), [&](const auto& entry) { return entry.get() == handle; }),
            entries_.end());
    }

    std::vector<std::shared_ptr<Handler>> entries_;
};

/// Eldbus complains on standard error about arguments that are not what is asked for.
bool hasArguments(const Eldbus_Message* signal, std::string_view types) {
    const char* signature = eldbus_message_signature_get(signal);
    return signature && signature == types;
}

}  // namespace

struct Events::State {
    using SettingHandlers = Handlers<const std::string&>;
    using PackageHandlers = Handlers<const PackageEvent&>;

    ~State() { disconnect(); }

    void connect(Bus& bus);
    void disconnect();
    Eldbus_Message* newSignal(const char* member) const;
    void send(Eldbus_Message* signal) const;
    bool canSend(const std::string& text) const { return connection && text.size() <= longestName && isUtf8(text); }

    static void whenConnectionEnds(void* state, const void* connection);
    static void whenBusIsLost(void* state, Eldbus_Connection* connection, void* event);
    static void whenSettingChanged(void* state, const Eldbus_Message* signal);
    static void whenPackageChanged(void* state, const Eldbus_Message* signal);

    std::shared_ptr<SettingHandlers> settings = std::make_shared<SettingHandlers>();
    std::shared_ptr<PackageHandlers> packages = std::make_shared<PackageHandlers>();
    Eldbus_Connection* connection = nullptr;
    Eldbus_Signal_Handler* settingSignals = nullptr;
    Eldbus_Signal_Handler* packageSignals = nullptr;
    std::string folder;
};

void Events::State::connect(Bus& bus) {
    disconnect();
    if (!bus.isAlive())
        return;
    connection = bus.connection();
    folder = bus.folder().root().string();
    eldbus_connection_free_cb_add(connection, whenConnectionEnds, this);
    eldbus_connection_event_callback_add(connection, ELDBUS_CONNECTION_EVENT_DISCONNECTED, whenBusIsLost, this);
    settingSignals = eldbus_signal_handler_add(connection, nullptr, bus::eventsPath, bus::eventsInterface,
                                               settingSignal, whenSettingChanged, this);
    packageSignals = eldbus_signal_handler_add(connection, nullptr, bus::eventsPath, bus::eventsInterface,
                                               packageSignal, whenPackageChanged, this);
}

void Events::State::disconnect() {
    if (!connection)
        return;
    eldbus_signal_handler_del(settingSignals);
    eldbus_signal_handler_del(packageSignals);
    eldbus_connection_event_callback_del(connection, ELDBUS_CONNECTION_EVENT_DISCONNECTED, whenBusIsLost, this);
    eldbus_connection_free_cb_del(connection, whenConnectionEnds, this);
    connection = nullptr;
}

Eldbus_Message* Events::State::newSignal(const char* member) const {
    return eldbus_message_signal_new(bus::eventsPath, bus::eventsInterface, member);
}

void Events::State::send(Eldbus_Message* signal) const {
    eldbus_connection_send(connection, signal, nullptr, nullptr, -1);
}

void Events::State::whenConnectionEnds(void* state, const void*) {
    // Eldbus ends the connection's signal handlers itself.
    static_cast<State*>(state)->connection = nullptr;
}

void Events::State::whenBusIsLost(void* state, Eldbus_Connection*, void*) {
    static_cast<State*>(state)->disconnect();
}

void Events::State::whenSettingChanged(void* state, const Eldbus_Message* signal) {
    const char* folder = nullptr;
    const char* key = nullptr;
    auto* self = static_cast<State*>(state);
    if (!hasArguments(signal, "ss") || !eldbus_message_arguments_get(signal, "ss", &folder, &key) ||
        self->folder != folder)
        return;
    const auto handlers = self->settings;
    handlers->call(key);
}

void Events::State::whenPackageChanged(void* state, const Eldbus_Message* signal) {
    const char* folder = nullptr;
    const char* id = nullptr;
    std::uint32_t type = 0;
    std::uint32_t progressState = 0;
    std::int32_t progress = 0;
    std::int32_t error = 0;
    auto* self = static_cast<State*>(state);
    if (!hasArguments(signal, "ssuuii") ||
        !eldbus_message_arguments_get(signal, "ssuuii", &folder, &id, &type, &progressState, &progress, &error) ||
        self->folder != folder)
        return;
    if (type > static_cast<std::uint32_t>(PackageEvent::Type::Update) ||
        progressState > static_cast<std::uint32_t>(PackageEvent::State::Failed))
        return;
    const auto handlers = self->packages;
    handlers->call(
        {id, static_cast<PackageEvent::Type>(type), static_cast<PackageEvent::State>(progressState), progress, error});
}

Events::Events() : state_(std::make_shared<State>()) {}

Events::~Events() = default;

Events::Subscription Events::onSetting(SettingHandler handler) {
    return state_->settings->add(std::move(handler));
}

Events::Subscription Events::onPackage(PackageHandler handler) {
    return state_->packages->add(std::move(handler));
}

void Events::publishSetting(const std::string& key) {
    if (!state_->canSend(key)) {
        const auto handlers = state_->settings;
        handlers->call(key);
        return;
    }
    Eldbus_Message* signal = state_->newSignal(settingSignal);
    eldbus_message_arguments_append(signal, "ss", state_->folder.c_str(), key.c_str());
    state_->send(signal);
}

void Events::publishPackage(const PackageEvent& event) {
    if (!state_->canSend(event.id)) {
        const auto handlers = state_->packages;
        handlers->call(event);
        return;
    }
    Eldbus_Message* signal = state_->newSignal(packageSignal);
    eldbus_message_arguments_append(signal, "ssuuii", state_->folder.c_str(), event.id.c_str(),
                                    static_cast<std::uint32_t>(event.type), static_cast<std::uint32_t>(event.state),
                                    static_cast<std::int32_t>(event.progress), static_cast<std::int32_t>(event.error));
    state_->send(signal);
}

void Events::connect(Bus& bus) {
    state_->connect(bus);
}

void Events::disconnect() {
    state_->disconnect();
}

}  // namespace device
