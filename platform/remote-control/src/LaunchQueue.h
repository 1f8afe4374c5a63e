#pragma once

#include "device/BootClock.h"
#include "remote-control/Server.h"

#include <Ecore.h>
#include <Eldbus.h>

#include <deque>
#include <functional>
#include <memory>
#include <string>
#include <vector>

namespace remote_control {

/// What callers want of the application as a whole, done in the order in which they asked. Each piece has a turn of the
/// main loop to itself, because it may end the application, and this object with it.
class LaunchQueue {
public:
    using Work = std::function<void()>;

    LaunchQueue(device::Bus& bus, std::string appId, Server::LaunchHandler launch);
    /// What is still waiting is neither done nor answered: who asked sees the application leave the bus.
    ~LaunchQueue();
    LaunchQueue(const LaunchQueue&) = delete;
    LaunchQueue& operator=(const LaunchQueue&) = delete;

    void add(Work work);
    /// One launch request after the other; the caller is answered just before the last one is delivered.
    /// Throws device::Error when the application takes none.
    void launch(const Eldbus_Message* call, const std::vector<Server::Extras>& requests);
    /// When the application had its last launch request, by device::secondsSinceBoot(); its first one comes with its
    /// start.
    double lastRequest() const { return lastRequest_; }

private:
    static void doNext(void* queue);

    device::Bus& bus_;
    const std::string appId_;
    const Server::LaunchHandler launch_;
    double lastRequest_ = device::secondsSinceBoot();
    std::deque<Work> waiting_;
    Ecore_Job* job_ = nullptr;
};

}  // namespace remote_control
