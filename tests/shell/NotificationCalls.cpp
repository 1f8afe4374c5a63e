#include "NotedCalls.h"

#include <app_control.h>
#include <notification.h>

using calls::note;
using calls::orNull;

CALL(int, app_control_create, app_control_h* request) {
    note("app_control_create");
    return __real_app_control_create(request);
}

CALL(int, app_control_destroy, app_control_h request) {
    note("app_control_destroy");
    return __real_app_control_destroy(request);
}

CALL(int, app_control_set_app_id, app_control_h request, const char* id) {
    note("app_control_set_app_id", id);
    return __real_app_control_set_app_id(request, id);
}

CALL(notification_h, notification_create, notification_type_e type) {
    note("notification_create", type);
    return __real_notification_create(type);
}

CALL(int, notification_free, notification_h notification) {
    note("notification_free");
    return __real_notification_free(notification);
}

CALL(int, notification_set_layout, notification_h notification, notification_ly_type_e layout) {
    note("notification_set_layout", layout);
    return __real_notification_set_layout(notification, layout);
}

CALL(int, notification_set_text, notification_h notification, notification_text_type_e type, const char* text,
     const char* key, int args, ...) {
    note("notification_set_text", type, text, key, args);
    return __real_notification_set_text(notification, type, text, key, args);
}

CALL(int, notification_set_image, notification_h notification, notification_image_type_e type, const char* path) {
    note("notification_set_image", type, orNull(path));
    return __real_notification_set_image(notification, type, path);
}

CALL(int, notification_set_launch_option, notification_h notification, notification_launch_option_type_e type,
     void* option) {
    note("notification_set_launch_option", type, orNull(option, "request"));
    return __real_notification_set_launch_option(notification, type, option);
}

CALL(int, notification_set_display_applist, notification_h notification, int places) {
    note("notification_set_display_applist", places);
    return __real_notification_set_display_applist(notification, places);
}

CALL(int, notification_post, notification_h notification) {
    note("notification_post");
    return __real_notification_post(notification);
}
