#pragma once

#include "tizen_error.h"

#ifdef __cplusplus
extern "C" {
#endif

typedef enum {
    APP_RESOURCE_ERROR_NONE = TIZEN_ERROR_NONE,
    APP_RESOURCE_ERROR_INVALID_PARAMETER = TIZEN_ERROR_INVALID_PARAMETER,
    APP_RESOURCE_ERROR_OUT_OF_MEMORY = TIZEN_ERROR_OUT_OF_MEMORY,
    APP_RESOURCE_ERROR_IO_ERROR = TIZEN_ERROR_IO_ERROR
} app_resource_error_e;

typedef enum {
    APP_RESOURCE_TYPE_IMAGE = 0,
    APP_RESOURCE_TYPE_LAYOUT,
    APP_RESOURCE_TYPE_SOUND,
    APP_RESOURCE_TYPE_BIN
} app_resource_e;

/**
 * Resolves one of the application's resources for the display in use: on a low-density display the file of that
 * name below res/LDPI/ when there is one, else the file below res/.
 * @param id path relative to res/, for example "edje/app.edj"
 * @param[out] path absolute path of an existing file, to be freed with free(); set to NULL on error
 * @return APP_RESOURCE_ERROR_NONE; IO_ERROR when there is no such file, or the device cannot be opened or read;
 *         INVALID_PARAMETER for NULL; OUT_OF_MEMORY
 */
int app_resource_manager_get(app_resource_e type, const char* id, char** path);

#ifdef __cplusplus
}
#endif
