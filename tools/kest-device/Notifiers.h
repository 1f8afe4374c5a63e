#pragma once

#include "Session.h"

#include <vector>

namespace tool {

/// Takes all notifications of the session's device off the desktop; they stay on the device. Returns the programs that
/// showed them and have ended. Needs no database. Throws device::Error when one does not end.
std::vector<device::Presenter::Shown> takeNotificationsDown(Session& session);

}  // namespace tool
