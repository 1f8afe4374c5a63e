#include "device/Notifications.h"

#include "JsonText.h"
#include "device/Database.h"

#include <cstdint>

namespace device {
namespace {

constexpr char columns[] = "notification.id, notification.time, app_id, layout, places, title, title_id, content, "
                           "content_id, icon, indicator_icon, launch_app_id, each.key, each.value "
                           "FROM notification LEFT JOIN json_each(notification.launch_extras) AS each";

/// From a row with these columns; without its extras.
Notification read(SQLite::Statement& row) {
    const auto text = [&row](int column) { return row.getColumn(column).getString(); };
    Notification notification;
    notification.id = row.getColumn(0).getInt64();
    notification.time = text(1);
    notification.appId = text(2);
    notification.layout = row.getColumn(3).getInt();
    notification.places = row.getColumn(4).getInt();
    notification.title = {text(5), text(6)};
    notification.content = {text(7), text(8)};
    notification.icon = text(9);
    notification.indicatorIcon = text(10);
    notification.launchAppId = text(11);
    return notification;
}

/// One row stands for each extra, and one for a notification without any.
std::vector<Notification> readAll(SQLite::Statement& row) {
    std::vector<Notification> notifications;
    while (row.executeStep()) {
        if (notifications.empty() || notifications.back().id != row.getColumn(0).getInt64())
            notifications.push_back(read(row));
        if (!row.isColumnNull(12))
            notifications.back().launchExtras.emplace_back(row.getColumn(12).getString(),
                                                           row.getColumn(13).getString());
    }
    return notifications;
}

}  // namespace

long long Notifications::append(const Notification& notification) {
    return database_.guarded([&] {
        SQLite::Statement insert(database_.sql(),
                                 "INSERT INTO notification (time, app_id, layout, places, title, title_id, content, "
                                 "content_id, icon, indicator_icon, launch_app_id, launch_extras) "
                                 "VALUES (strftime('%Y-%m-%dT%H:%M:%fZ', 'now'), ?, ?, ?, ?, ?, ?, ?, ?, ?, ?, " +
                                     jsonObjectOf(notification.launchExtras.size()) + ")");
        int index = 0;
        insert.bind(++index, notification.appId);
        insert.bind(++index, notification.layout);
        insert.bind(++index, notification.places);
        for (const std::string* text :
             {&notification.title.plain, &notification.title.id, &notification.content.plain, &notification.content.id,
              &notification.icon, &notification.indicatorIcon, &notification.launchAppId})
            insert.bind(++index, *text);
        bindPairs(insert, index, notification.launchExtras);
        insert.exec();
        return static_cast<long long>(database_.sql().getLastInsertRowid());
    });
}

std::vector<Notification> Notifications::all() const {
    return database_.guarded([&] {
        SQLite::Statement row(database_.sql(), std::string("SELECT ") + columns + " ORDER BY notification.id, each.id");
        return readAll(row);
    });
}

std::optional<Notification> Notifications::find(long long id) const {
    return database_.guarded([&]() -> std::optional<Notification> {
        SQLite::Statement row(database_.sql(),
                              std::string("SELECT ") + columns + " WHERE notification.id = ? ORDER BY each.id");
        row.bind(1, static_cast<std::int64_t>(id));
        const std::vector<Notification> found = readAll(row);
        return found.empty() ? std::nullopt : std::optional(found.front());
    });
}

void Notifications::remove(long long id) {
    database_.guarded(
        [&] { database_.query("DELETE FROM notification WHERE id = ?", static_cast<std::int64_t>(id))->exec(); });
}

void Notifications::removeAll() {
    database_.guarded([&] { database_.query("DELETE FROM notification")->exec(); });
}

}  // namespace device
