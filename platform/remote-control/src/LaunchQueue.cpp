#include "LaunchQueue.h"

#include "Guarded.h"
#include "Requests.h"
#include "device/Bus.h"

#include <utility>

namespace remote_control {

LaunchQueue::LaunchQueue(device::Bus& bus, std::string appId, Server::LaunchHandler launch)
    : bus_(bus), appId_(std::move(appId)), launch_(std::move(launch)) {}

LaunchQueue::~LaunchQueue() {
    if (job_) {
        ecore_job_del(job_);
    }
}

void LaunchQueue::add(Work work) {
    waiting_.push_back(std::move(work));
    if (!job_) {
        job_ = ecore_job_add(doNext, this);
    }
}

void LaunchQueue::launch(const Eldbus_Message* call, const std::vector<Server::Extras>& requests) {
    if (!launch_) {
        throw device::Error(appId_ + " takes no launch requests while it runs");
    }
    lastRequest_ = device::secondsSinceBoot();
    for (std::size_t i = 0; i < requests.size(); ++i) {
        const std::shared_ptr<Eldbus_Message> answered = i + 1 == requests.size() ? keep(call) : nullptr;
        add([this, answered, launch = launch_, extras = requests[i]] {
            // The caller has no answer, so the request is still his.
            if (!bus_.isAlive()) {
                return;
            }
            if (answered) {
                eldbus_connection_send(bus_.connection(), eldbus_message_method_return_new(answered.get()), nullptr,
                                       nullptr, -1);
            }
            launch(extras);
        });
    }
}

void LaunchQueue::doNext(void* queue) {
    auto* self = static_cast<LaunchQueue*>(queue);
    const Work work = std::move(self->waiting_.front());
    self->waiting_.pop_front();
    self->job_ = self->waiting_.empty() ? nullptr : ecore_job_add(doNext, self);
    guarded(work);
}

}  // namespace remote_control
