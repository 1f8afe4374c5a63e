#pragma once

#ifdef __cplusplus
extern "C" {
#endif

/**
 * The directory of the application's own resources.
 * @return absolute, ends with "/"; to be freed with free(); NULL when it cannot be told
 */
char* app_get_resource_path(void);

/**
 * The id of the running application.
 * @param[out] id to be freed with free(); untouched on error
 * @return TIZEN_ERROR_NONE; INVALID_PARAMETER for NULL; OUT_OF_MEMORY; IO_ERROR when the device cannot be opened or
 *         the process is no application
 */
int app_get_id(char** id);

/** What an application may be told of; the numbers are the interface's own. The device sends LANGUAGE_CHANGED only. */
typedef enum {
    APP_EVENT_LOW_MEMORY = 0,
    APP_EVENT_LOW_BATTERY = 1,
    APP_EVENT_LANGUAGE_CHANGED = 2,
    APP_EVENT_DEVICE_ORIENTATION_CHANGED = 3,
    APP_EVENT_REGION_FORMAT_CHANGED = 4
} app_event_type_e;

/** What an event carries. Opaque. */
typedef struct app_event_info* app_event_info_h;

#ifdef __cplusplus
}
#endif
