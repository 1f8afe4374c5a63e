#include "remote-control/Server.h"

#include "ActionQueue.h"
#include "ApplicationService.h"
#include "Condition.h"
#include "DesktopService.h"
#include "Element.h"
#include "Input.h"
#include "Requests.h"
#include "Screenshot.h"
#include "TextSearch.h"
#include "TreeJson.h"
#include "device/Bus.h"
#include "device/Error.h"

#include <Eldbus.h>

#include <vector>

namespace remote_control {

namespace {

constexpr char stateKey[] = "remote-control";

using Steps = std::function<std::vector<Playback::Step>(Evas* canvas)>;

}  // namespace

struct Server::State {
    State(device::Bus& deviceBus, const std::string& id, Application asked)
        : bus(deviceBus), appId(id), window(std::move(asked.window)), requests(deviceBus, id, std::move(asked.launch)),
          application(deviceBus, id, std::move(asked.quit), requests),
          desktop(deviceBus, id, std::move(asked.link), requests),
          actions([this] { return evas_object_evas_get(requireWindow()); }) {}
    ~State();

    void exportObject();
    Evas_Object* requireWindow() const;
    /// Answers from the main loop when the steps were carried out and the screen has settled.
    Eldbus_Message* answerWhenSettled(const Eldbus_Message* request, Steps steps);

    static State& of(const Eldbus_Service_Interface* interface) {
        return *static_cast<State*>(eldbus_service_object_data_get(interface, stateKey));
    }
    using Method = Eldbus_Message*(const Eldbus_Service_Interface*, const Eldbus_Message*);
    static Method onTree, onTap, onTapText, onSwipe, onKey, onHas, onScreenshot, onSettle;

    device::Bus& bus;
    const std::string appId;
    const std::function<Evas_Object*()> window;
    LaunchQueue requests;
    ApplicationService application;
    DesktopService desktop;
    ActionQueue actions;
    Eldbus_Service_Interface* screen = nullptr;
};

Server::Server(device::Bus& bus, const std::string& appId, Application application)
    : state_(std::make_unique<State>(bus, appId, std::move(application))) {
    state_->exportObject();
}

Server::~Server() = default;

void Server::State::exportObject() {
    static const Eldbus_Method screenMethods[] = {
        {"Tree", nullptr, ELDBUS_ARGS({"s", "json"}), onTree, 0},
        {"Tap", ELDBUS_ARGS({"i", "x"}, {"i", "y"}), nullptr, onTap, 0},
        {"TapText", ELDBUS_ARGS({"s", "text"}), nullptr, onTapText, 0},
        {"Swipe", ELDBUS_ARGS({"i", "x1"}, {"i", "y1"}, {"i", "x2"}, {"i", "y2"}, {"d", "seconds"}), nullptr, onSwipe,
         0},
        {"Key", ELDBUS_ARGS({"s", "name"}), nullptr, onKey, 0},
        {"Has", ELDBUS_ARGS({"s", "condition"}), ELDBUS_ARGS({"b", "holds"}), onHas, 0},
        {"Screenshot", ELDBUS_ARGS({"s", "file"}), nullptr, onScreenshot, 0},
        {"Settle", nullptr, nullptr, onSettle, 0},
        {}};
    static const Eldbus_Service_Interface_Desc screenDescription = {
        device::bus::screenInterface, screenMethods, nullptr, nullptr, nullptr, nullptr};
    screen = offer(bus, appId, screenDescription);
    eldbus_service_object_data_set(screen, stateKey, this);
}

Server::State::~State() {
    if (screen) {
        eldbus_service_interface_unregister(screen);
    }
}

Evas_Object* Server::State::requireWindow() const {
    Evas_Object* object = window();
    if (!object) {
        throw device::Error(appId + " has no window");
    }
    return object;
}

Eldbus_Message* Server::State::answerWhenSettled(const Eldbus_Message* request, Steps steps) {
    actions.add({std::move(steps), [this, kept = keep(request)](const std::string& error) {
                     Eldbus_Message* reply = error.empty()
                                                 ? eldbus_message_method_return_new(kept.get())
                                                 : eldbus_message_error_new(kept.get(), errorName, error.c_str());
                     eldbus_connection_send(bus.connection(), reply, nullptr, nullptr, -1);
                 }});
    return nullptr;
}

Eldbus_Message* Server::State::onTree(const Eldbus_Service_Interface* interface, const Eldbus_Message* request) {
    return answer(request, [&] {
        const std::string tree = treeOf(of(interface).requireWindow());
        Eldbus_Message* reply = eldbus_message_method_return_new(request);
        eldbus_message_arguments_append(reply, "s", tree.c_str());
        of(interface).bus.flushSoon();
        return reply;
    });
}

Eldbus_Message* Server::State::onTap(const Eldbus_Service_Interface* interface, const Eldbus_Message* request) {
    return answer(request, [&] {
        int x = 0;
        int y = 0;
        arguments(request, "ii", &x, &y);
        return of(interface).answerWhenSettled(request, [=](Evas* canvas) { return input::tap(canvas, x, y); });
    });
}

Eldbus_Message* Server::State::onTapText(const Eldbus_Service_Interface* interface, const Eldbus_Message* request) {
    return answer(request, [&] {
        const char* words = nullptr;
        arguments(request, "s", &words);
        State& state = of(interface);
        return state.answerWhenSettled(request, [&state, text = std::string(words)](Evas* canvas) {
            const Rectangle place = touchPlace(findText(readScreen(state.requireWindow()), text), text);
            return input::tap(canvas, place.centreX(), place.centreY());
        });
    });
}

Eldbus_Message* Server::State::onSwipe(const Eldbus_Service_Interface* interface, const Eldbus_Message* request) {
    return answer(request, [&] {
        int x1 = 0;
        int y1 = 0;
        int x2 = 0;
        int y2 = 0;
        double seconds = 0;
        arguments(request, "iiiid", &x1, &y1, &x2, &y2, &seconds);
        return of(interface).answerWhenSettled(
            request, [=](Evas* canvas) { return input::swipe(canvas, x1, y1, x2, y2, seconds); });
    });
}

Eldbus_Message* Server::State::onKey(const Eldbus_Service_Interface* interface, const Eldbus_Message* request) {
    return answer(request, [&] {
        const char* name = nullptr;
        arguments(request, "s", &name);
        return of(interface).answerWhenSettled(
            request, [key = std::string(name)](Evas* canvas) { return input::key(canvas, key); });
    });
}

Eldbus_Message* Server::State::onHas(const Eldbus_Service_Interface* interface, const Eldbus_Message* request) {
    return answer(request, [&] {
        const char* words = nullptr;
        arguments(request, "s", &words);
        const bool holds = Condition(words).holdsOn(readScreen(of(interface).requireWindow()));
        Eldbus_Message* reply = eldbus_message_method_return_new(request);
        eldbus_message_arguments_append(reply, "b", Eina_Bool(holds));
        return reply;
    });
}

Eldbus_Message* Server::State::onScreenshot(const Eldbus_Service_Interface* interface, const Eldbus_Message* request) {
    return answer(request, [&] {
        const char* file = nullptr;
        arguments(request, "s", &file);
        writeScreenshot(of(interface).requireWindow(), file);
        return eldbus_message_method_return_new(request);
    });
}

Eldbus_Message* Server::State::onSettle(const Eldbus_Service_Interface* interface, const Eldbus_Message* request) {
    return answer(request, [&] {
        return of(interface).answerWhenSettled(request, [](Evas*) { return std::vector<Playback::Step>(); });
    });
}

}  // namespace remote_control
