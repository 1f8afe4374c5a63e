#pragma once

#include "tizen_error.h"

#include <stdbool.h>

#ifdef __cplusplus
extern "C" {
#endif

typedef enum {
    APP_CONTROL_ERROR_NONE = TIZEN_ERROR_NONE,
    APP_CONTROL_ERROR_INVALID_PARAMETER = TIZEN_ERROR_INVALID_PARAMETER,
    APP_CONTROL_ERROR_OUT_OF_MEMORY = TIZEN_ERROR_OUT_OF_MEMORY,
    APP_CONTROL_ERROR_KEY_NOT_FOUND = TIZEN_ERROR_KEY_NOT_AVAILABLE
} app_control_error_e;

/** A launch request: an application id and string extras. Opaque. */
typedef struct app_control_s* app_control_h;

/** @param[out] app_control to be freed with app_control_destroy() */
int app_control_create(app_control_h* app_control);
int app_control_destroy(app_control_h app_control);

int app_control_set_app_id(app_control_h app_control, const char* app_id);
/** @param[out] app_id to be freed with free() @return KEY_NOT_FOUND when none was set */
int app_control_get_app_id(app_control_h app_control, char** app_id);

/** Adds an extra or replaces it. Both strings are copied; neither may be NULL, the key not empty. */
int app_control_add_extra_data(app_control_h app_control, const char* key, const char* value);
/** @param[out] value to be freed with free(); untouched on error @return KEY_NOT_FOUND when there is no such extra */
int app_control_get_extra_data(app_control_h app_control, const char* key, char** value);

/** Calls `callback` for each extra in the order of their keys until it returns false. */
typedef bool (*app_control_extra_data_cb)(app_control_h app_control, const char* key, void* user_data);
int app_control_foreach_extra_data(app_control_h app_control, app_control_extra_data_cb callback, void* user_data);

#ifdef __cplusplus
}
#endif
