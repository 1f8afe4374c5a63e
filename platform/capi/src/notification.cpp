#include "notification.h"

#include "AppControl.h"
#include "Service.h"

#include <memory>

struct notification_s {
    device::Notification content;
};

namespace {

/// Where the notification keeps that text or picture; null for a type that is not known.
device::NotificationText* textOf(notification_h notification, int type) {
    switch (type) {
    case NOTIFICATION_TEXT_TYPE_TITLE:
        return &notification->content.title;
    case NOTIFICATION_TEXT_TYPE_CONTENT:
        return &notification->content.content;
    default:
        return nullptr;
    }
}

std::string* imageOf(notification_h notification, int type) {
    switch (type) {
    case NOTIFICATION_IMAGE_TYPE_ICON:
        return &notification->content.icon;
    case NOTIFICATION_IMAGE_TYPE_ICON_FOR_INDICATOR:
        return &notification->content.indicatorIcon;
    default:
        return nullptr;
    }
}

/// Runs `body` on the notification that the caller gave.
template <class Body>
int change(const char* name, notification_h notification, Body&& body) noexcept {
    return service::call(name, [&]() -> int { return notification ? body() : NOTIFICATION_ERROR_INVALID_PARAMETER; });
}

}  // namespace

notification_h notification_create(notification_type_e type) {
    notification_h made = nullptr;
    service::call("notification_create", [&]() -> int {
        if (service::numberOf(type) == NOTIFICATION_TYPE_NONE)
            return NOTIFICATION_ERROR_INVALID_PARAMETER;
        made = std::make_unique<notification_s>().release();
        return NOTIFICATION_ERROR_NONE;
    });
    return made;
}

int notification_free(notification_h notification) {
    return service::call("notification_free", [&]() -> int {
        const std::unique_ptr<notification_s> owned(notification);
        return owned ? NOTIFICATION_ERROR_NONE : NOTIFICATION_ERROR_INVALID_PARAMETER;
    });
}

int notification_set_layout(notification_h notification, notification_ly_type_e layout) {
    return change("notification_set_layout", notification, [&] {
        notification->content.layout = service::numberOf(layout);
        return NOTIFICATION_ERROR_NONE;
    });
}

int notification_set_text(notification_h notification, notification_text_type_e type, const char* text, const char* key,
                          int args_type, ...) {
    return change("notification_set_text", notification, [&] {
        device::NotificationText* kept = textOf(notification, service::numberOf(type));
        if (!kept || args_type != NOTIFICATION_VARIABLE_TYPE_NONE)
            return NOTIFICATION_ERROR_INVALID_PARAMETER;
        *kept = {text ? text : "", text && key ? key : ""};
        return NOTIFICATION_ERROR_NONE;
    });
}

int notification_set_image(notification_h notification, notification_image_type_e type, const char* image_path) {
    return change("notification_set_image", notification, [&] {
        std::string* kept = imageOf(notification, service::numberOf(type));
        if (!kept || !image_path)
            return NOTIFICATION_ERROR_INVALID_PARAMETER;
        *kept = image_path;
        return NOTIFICATION_ERROR_NONE;
    });
}

int notification_set_launch_option(notification_h notification, notification_launch_option_type_e type, void* option) {
    return change("notification_set_launch_option", notification, [&] {
        const auto* request = static_cast<app_control_h>(option);
        if (service::numberOf(type) != NOTIFICATION_LAUNCH_OPTION_APP_CONTROL || !request || request->appId.empty())
            return NOTIFICATION_ERROR_INVALID_PARAMETER;
        notification->content.launchAppId = request->appId;
        notification->content.launchExtras = {request->extras.begin(), request->extras.end()};
        return NOTIFICATION_ERROR_NONE;
    });
}

int notification_set_display_applist(notification_h notification, int applist) {
    return change("notification_set_display_applist", notification, [&] {
        notification->content.places = applist;
        return NOTIFICATION_ERROR_NONE;
    });
}

int notification_post(notification_h notification) {
    return service::callOnDevice("notification_post", [&](device::Device& device) -> int {
        if (!notification)
            return NOTIFICATION_ERROR_INVALID_PARAMETER;
        device::Notification posted = notification->content;
        posted.appId = device.application().id;
        const long long id = device.notifications().append(posted);
        device.presenter().show(id);
        return NOTIFICATION_ERROR_NONE;
    });
}
