#pragma once

#include <optional>
#include <string>
#include <utility>
#include <vector>

namespace device {

class Database;

/// A text of a notification.
struct NotificationText {
    std::string plain;  ///< shows where the id has no translation
    std::string id;     ///< in the posting application's gettext domain; may be empty
};

/// A notification as the device keeps it.
struct Notification {
    long long id = 0;   ///< given by the device, from 1, never reused
    std::string time;   ///< UTC, ISO 8601 with milliseconds; given by the device
    std::string appId;  ///< who posted it
    int layout = 0;     ///< notification_ly_type_e
    int places = 0;     ///< where it shows: the bits of notification_display_app_type_e
    NotificationText title;
    NotificationText content;
    std::string icon;
    std::string indicatorIcon;
    std::string launchAppId;  ///< whom a click asks; empty: nobody
    std::vector<std::pair<std::string, std::string>> launchExtras;
};

/// The notifications on the device, in the order in which they came. All throw Error when the database fails.
class Notifications {
public:
    explicit Notifications(Database& database) : database_(database) {}

    /// Stores it and returns its id; its own id and time do not count.
    long long append(const Notification& notification);
    std::vector<Notification> all() const;
    std::optional<Notification> find(long long id) const;
    /// One that was opened or taken away. Harmless for an id that is not there.
    void remove(long long id);
    void removeAll();

private:
    Database& database_;
};

}  // namespace device
