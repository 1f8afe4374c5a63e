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
    APP_CONTROL_ERROR_IO_ERROR = TIZEN_ERROR_IO_ERROR,
    APP_CONTROL_ERROR_NOT_SUPPORTED = TIZEN_ERROR_NOT_SUPPORTED,
    APP_CONTROL_ERROR_KEY_NOT_FOUND = TIZEN_ERROR_KEY_NOT_AVAILABLE,
    APP_CONTROL_ERROR_APP_NOT_FOUND = -0x01100000 | 0x21,
    APP_CONTROL_ERROR_LAUNCH_REJECTED = -0x01100000 | 0x23,
    APP_CONTROL_ERROR_LAUNCH_FAILED = -0x01100000 | 0x24
} app_control_error_e;

/** A launch request: an application id and string extras. Opaque. */
typedef struct app_control_s* app_control_h;

/**
 * Makes an empty request.
 * @param[out] app_control to be freed with app_control_destroy(); untouched on error
 * @return APP_CONTROL_ERROR_NONE; INVALID_PARAMETER for NULL; OUT_OF_MEMORY
 */
int app_control_create(app_control_h* app_control);

/** Frees a request and its extras. @return APP_CONTROL_ERROR_NONE; INVALID_PARAMETER for NULL (which does no harm) */
int app_control_destroy(app_control_h app_control);

/**
 * Says which application is meant, in place of an earlier one.
 * @param app_id is copied; "" takes the id away
 * @return APP_CONTROL_ERROR_NONE; INVALID_PARAMETER for NULL; OUT_OF_MEMORY
 */
int app_control_set_app_id(app_control_h app_control, const char* app_id);

/**
 * Gives the id of the application that is meant.
 * @param[out] app_id to be freed with free(); untouched on error
 * @return APP_CONTROL_ERROR_NONE; KEY_NOT_FOUND when none was set; INVALID_PARAMETER for NULL; OUT_OF_MEMORY
 */
int app_control_get_app_id(app_control_h app_control, char** app_id);

/**
 * Adds an extra or replaces it. Both strings are copied.
 * @return APP_CONTROL_ERROR_NONE; INVALID_PARAMETER for NULL or an empty key; OUT_OF_MEMORY
 */
int app_control_add_extra_data(app_control_h app_control, const char* key, const char* value);

/**
 * Gives the value of an extra.
 * @param[out] value to be freed with free(); untouched on error
 * @return APP_CONTROL_ERROR_NONE; KEY_NOT_FOUND when there is no such extra; INVALID_PARAMETER for NULL or an empty
 *         key; OUT_OF_MEMORY
 */
int app_control_get_extra_data(app_control_h app_control, const char* key, char** value);

/** @param key the request's own, as long as the call lasts @return whether to go on with the next extra */
typedef bool (*app_control_extra_data_cb)(app_control_h app_control, const char* key, void* user_data);

/**
 * Calls `callback` for each extra in the order of their keys until it returns false. It may change the extras; those
 * that were there at first are gone through.
 * @return APP_CONTROL_ERROR_NONE, also when the callback ended it; INVALID_PARAMETER for NULL; OUT_OF_MEMORY
 */
int app_control_foreach_extra_data(app_control_h app_control, app_control_extra_data_cb callback, void* user_data);

typedef enum {
    APP_CONTROL_RESULT_APP_STARTED = 1,
    APP_CONTROL_RESULT_SUCCEEDED = 0,
    APP_CONTROL_RESULT_FAILED = -1,
    APP_CONTROL_RESULT_CANCELED = -2
} app_control_result_e;

/** Told of the answer to a launch request. */
typedef void (*app_control_reply_cb)(app_control_h request, app_control_h reply, app_control_result_e result,
                                     void* user_data);

/**
 * Has the application that the request names started with the request's extras, or, when it runs already, told of
 * them, and comes back as soon as its program is loaded: it does not wait for the application. What has come of it
 * stands in the device's record of launches.
 * @param callback must be NULL: applications do not answer requests here
 * @return APP_CONTROL_ERROR_NONE when the application has been started or is being told; APP_NOT_FOUND when none is
 *         named or installed under that id, or it has no program; LAUNCH_REJECTED when an extra is not UTF-8, has a
 *         "=" in its key, or all are larger than 64 KiB; LAUNCH_FAILED when the program cannot be started or the
 *         package's manifest is broken; NOT_SUPPORTED for a callback; INVALID_PARAMETER for a NULL request;
 *         OUT_OF_MEMORY; IO_ERROR when the device cannot be opened or the process is no application
 */
int app_control_send_launch_request(app_control_h app_control, app_control_reply_cb callback, void* user_data);

#ifdef __cplusplus
}
#endif
