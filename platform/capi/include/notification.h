#pragma once

#include "app_control.h"
#include "tizen_error.h"

#ifdef __cplusplus
extern "C" {
#endif

typedef enum {
    NOTIFICATION_ERROR_NONE = TIZEN_ERROR_NONE,
    NOTIFICATION_ERROR_INVALID_PARAMETER = TIZEN_ERROR_INVALID_PARAMETER,
    NOTIFICATION_ERROR_OUT_OF_MEMORY = TIZEN_ERROR_OUT_OF_MEMORY,
    NOTIFICATION_ERROR_IO_ERROR = TIZEN_ERROR_IO_ERROR
} notification_error_e;

typedef enum { NOTIFICATION_TYPE_NONE = -1, NOTIFICATION_TYPE_NOTI = 0 } notification_type_e;

typedef enum { NOTIFICATION_LY_NONE = 0, NOTIFICATION_LY_NOTI_EVENT_SINGLE = 1 } notification_ly_type_e;

typedef enum { NOTIFICATION_TEXT_TYPE_TITLE = 0, NOTIFICATION_TEXT_TYPE_CONTENT = 1 } notification_text_type_e;

/** Ends the values that a text takes; texts with values are not supported. */
typedef enum { NOTIFICATION_VARIABLE_TYPE_NONE = -1 } notification_variable_type_e;

typedef enum {
    NOTIFICATION_IMAGE_TYPE_ICON = 0,
    NOTIFICATION_IMAGE_TYPE_ICON_FOR_INDICATOR = 1
} notification_image_type_e;

typedef enum { NOTIFICATION_LAUNCH_OPTION_APP_CONTROL = 1 } notification_launch_option_type_e;

/** Where a notification shows; bits. */
typedef enum {
    NOTIFICATION_DISPLAY_APP_NOTIFICATION_TRAY = 0x0001,
    NOTIFICATION_DISPLAY_APP_TICKER = 0x0002,
    NOTIFICATION_DISPLAY_APP_LOCK = 0x0004,
    NOTIFICATION_DISPLAY_APP_INDICATOR = 0x0008,
    NOTIFICATION_DISPLAY_APP_ALL = 0x000f
} notification_display_app_type_e;

/** A notification that is made up, to be posted. Opaque. */
typedef struct notification_s* notification_h;

/** Makes an empty notification, to be freed with notification_free(). NULL for NOTIFICATION_TYPE_NONE or no memory. */
notification_h notification_create(notification_type_e type);

/** Frees a notification; one that was posted stays on the device. @return NONE; INVALID_PARAMETER for NULL */
int notification_free(notification_h notification);

/** Says how it is laid out. @return NONE; INVALID_PARAMETER for NULL */
int notification_set_layout(notification_h notification, notification_ly_type_e layout);

/**
 * Sets a text.
 * @param text shows where `key` has no translation; copied, NULL takes the text away
 * @param key the text's id in the posting application's own gettext domain; copied, may be NULL. The text shows in the
 *        device's language at the time when somebody looks.
 * @param args_type NOTIFICATION_VARIABLE_TYPE_NONE
 * @return NONE; INVALID_PARAMETER for NULL, another type of text or another `args_type`; OUT_OF_MEMORY
 */
int notification_set_text(notification_h notification, notification_text_type_e type, const char* text, const char* key,
                          int args_type, ...);

/**
 * Sets a picture.
 * @param image_path is copied; the file need not be there
 * @return NONE; INVALID_PARAMETER for NULL or another type of picture; OUT_OF_MEMORY
 */
int notification_set_image(notification_h notification, notification_image_type_e type, const char* image_path);

/**
 * Sets the launch request that a click sends.
 * @param option an app_control_h with an application id, which is copied with its extras
 * @return NONE; INVALID_PARAMETER for NULL, another type of option, or a request without an id; OUT_OF_MEMORY
 */
int notification_set_launch_option(notification_h notification, notification_launch_option_type_e type, void* option);

/** Says where it shows, by the bits of notification_display_app_type_e. @return NONE; INVALID_PARAMETER for NULL */
int notification_set_display_applist(notification_h notification, int applist);

/**
 * Puts it on the device and has the desktop show it, where there is one.
 * @return NONE; INVALID_PARAMETER for NULL; IO_ERROR when the device cannot keep it
 */
int notification_post(notification_h notification);

#ifdef __cplusplus
}
#endif
