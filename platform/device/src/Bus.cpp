#include "device/Bus.h"

#include "BlockingConnection.h"
#include "BusAddress.h"
#include "device/Error.h"
#include "device/MainLoop.h"

#include <Ecore.h>

#include <algorithm>
#include <cstdio>
#include <exception>

namespace device {

std::string bus::pathOf(const std::string& appId) {
    std::string path = "/" + appId;
    std::replace(path.begin(), path.end(), '.', '/');
    std::replace(path.begin(), path.end(), '-', '_');
    return path;
}

namespace {

/// Once for the whole process, as the main loop that it needs.
void startEldbus() {
    startMainLoop();
    static const bool started = eldbus_init() > 0;
    if (!started)
        throw Error("Eldbus cannot be started; check the installation of EFL");
}

constexpr double answerTimeoutInMilliseconds = 5000;

}  // namespace

struct Bus::Link {
    Link(const Folder& device, BusAddress at);
    ~Link();
    Link(const Link&) = delete;
    Link& operator=(const Link&) = delete;

    static void whenDisconnected(void* link, Eldbus_Connection* connection, void* event);
    static void tellLost(void* link);
    static void flush(void* link);
    void ping() const;
    unsigned callOfBus(const char* method, const std::string& name, const unsigned* flags) const;

    Folder folder;
    BusAddress address;
    Eldbus_Connection* connection = nullptr;
    Eldbus_Object* busObject = nullptr;
    Eldbus_Proxy* busProxy = nullptr;
    std::unique_ptr<BlockingConnection> blocking;
    std::function<void()> lost;
    Ecore_Job* telling = nullptr;
    Ecore_Job* flushing = nullptr;
    bool alive = true;
};

Bus::Link::Link(const Folder& device, BusAddress at)
    : folder(device), address(std::move(at)), connection(eldbus_private_address_connection_get(address.text.c_str())) {
    if (!connection)
        return;
    eldbus_connection_event_callback_add(connection, ELDBUS_CONNECTION_EVENT_DISCONNECTED, whenDisconnected, this);
    busObject = eldbus_object_get(connection, ELDBUS_FDO_BUS, ELDBUS_FDO_PATH);
    busProxy = eldbus_proxy_get(busObject, ELDBUS_FDO_INTERFACE);
}

Bus::Link::~Link() {
    if (telling)
        ecore_job_del(telling);
    if (flushing)
        ecore_job_del(flushing);
    if (!connection)
        return;
    eldbus_connection_event_callback_del(connection, ELDBUS_CONNECTION_EVENT_DISCONNECTED, whenDisconnected, this);
    eldbus_proxy_unref(busProxy);
    eldbus_object_unref(busObject);
    eldbus_connection_unref(connection);
}

void Bus::Link::whenDisconnected(void* link, Eldbus_Connection*, void*) {
    auto* self = static_cast<Link*>(link);
    self->alive = false;
    // The handler may destroy the connection, which Eldbus still needs here.
    if (!self->telling)
        self->telling = ecore_job_add(tellLost, self);
}

void Bus::Link::tellLost(void* link) {
    auto* self = static_cast<Link*>(link);
    self->telling = nullptr;
    const std::function<void()> handler = self->lost;
    try {
        if (handler)
            handler();
    } catch (const std::exception& failure) {
        std::fprintf(stderr, "%s\n", failure.what());
    }
}

void Bus::Link::flush(void* link) {
    auto* self = static_cast<Link*>(link);
    self->flushing = nullptr;
    try {
        if (self->alive)
            self->ping();
    } catch (const std::exception&) {
        // The bus has just gone, and whoever wants to know is told by whenDisconnected().
        return;
    }
}

void Bus::Link::ping() const {
    callOfBus("GetConnectionUnixProcessID", ELDBUS_FDO_BUS, nullptr);
}

unsigned Bus::Link::callOfBus(const char* method, const std::string& name, const unsigned* flags) const {
    Eldbus_Message* call = eldbus_proxy_method_call_new(busProxy, method);
    eldbus_message_arguments_append(call, "s", name.c_str());
    if (flags)
        eldbus_message_arguments_append(call, "u", *flags);
    Eldbus_Message* answer = eldbus_proxy_send_and_block(busProxy, call, answerTimeoutInMilliseconds);
    unsigned result = 0;
    const bool understood = answer && eldbus_message_arguments_get(answer, "u", &result);
    if (answer)
        eldbus_message_unref(answer);
    if (!understood)
        throw Error("the device's bus does not answer at " + address.text + "; start the device anew");
    return result;
}

std::unique_ptr<Bus> Bus::connect(const Folder& folder) {
    for (const BusAddress& address : busAddresses(folder)) {
        if (!answers(address.text))
            continue;
        startEldbus();
        auto link = std::make_unique<Link>(folder, address);
        if (link->connection)
            return std::make_unique<Bus>(std::move(link));
    }
    return nullptr;
}

Bus::Bus(std::unique_ptr<Link> link) : link_(std::move(link)) {}

Bus::~Bus() = default;

Eldbus_Connection* Bus::connection() const {
    return link_->connection;
}

const Folder& Bus::folder() const {
    return link_->folder;
}

const std::string& Bus::address() const {
    return link_->address.text;
}

bool Bus::isPrivate() const {
    return link_->address.isPrivate;
}

bool Bus::isAlive() const {
    return link_->alive;
}

void Bus::onLost(std::function<void()> handler) {
    link_->lost = std::move(handler);
}

void Bus::flushSoon() const {
    if (!link_->flushing)
        link_->flushing = ecore_job_add(Link::flush, link_.get());
}

BlockingConnection& Bus::blocking() const {
    if (!link_->alive)
        throw Error("the device's bus has gone; start the device anew");
    if (!link_->blocking)
        link_->blocking = std::make_unique<BlockingConnection>(link_->address.text);
    const auto timeout = std::chrono::milliseconds(static_cast<int>(answerTimeoutInMilliseconds));
    // Asked first on the connection that can say no in peace, then on the other, behind all that it has sent.
    link_->blocking->answerTo(BlockingConnection::callOfBus("GetId"), timeout);
    link_->ping();
    return *link_->blocking;
}

unsigned Bus::requestName(const std::string& name, unsigned flags) const {
    return link_->callOfBus("RequestName", name, &flags);
}

void Bus::releaseName(const std::string& name) const {
    link_->callOfBus("ReleaseName", name, nullptr);
}

}  // namespace device
