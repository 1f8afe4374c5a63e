#include "Notifiers.h"

namespace tool {

std::vector<device::Presenter::Shown> takeNotificationsDown(Session& session) {
    device::Log log(session.folder().log());
    return device::Presenter(session.folder(), log, device::Device::Options::standard().notifier).takeAllDown();
}

}  // namespace tool
