#pragma once

#include <string>

namespace device {
class Device;
struct Notification;
}  // namespace device

/// What a person sees of a notification, wherever it is shown.
struct NotificationAppearance {
    std::string application;  ///< the name of the one that posted it
    std::string title;
    std::string content;
    std::string icon;  ///< absolute path of a picture that is there; empty for none

    /// As it is now: its texts in the device's language, from the gettext catalogues of the application that posted it,
    /// or as that gave them where they are not translated. They are UTF-8 in any case.
    /// Makes the device's language that of this process's texts. Throws device::Error when the device cannot be read.
    static NotificationAppearance of(device::Device& device, const device::Notification& notification);
};
