#pragma once

#include "notifier/NotificationAppearance.h"

#include <Eldbus.h>

#include <cstdint>
#include <string>

/// What a notification daemon is asked to show.
struct NotifyCall {
    std::uint32_t replaces = 0;  ///< the daemon's number of what shows already; 0 for none
    std::string appId;           ///< who posted it
    NotificationAppearance appearance;
    bool isClickable = false;
    bool asMarkup = false;  ///< whether the daemon takes the text for markup

    /// The action that a click on the notification itself means.
    static constexpr char click[] = "default";

    /// Fills the arguments of the method Notify.
    void appendTo(Eldbus_Message* message) const;
};
