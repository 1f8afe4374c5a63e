#pragma once

#include "tizen_error.h"

#ifdef __cplusplus
extern "C" {
#endif

typedef enum {
    APP_MANAGER_ERROR_NONE = TIZEN_ERROR_NONE,
    APP_MANAGER_ERROR_INVALID_PARAMETER = TIZEN_ERROR_INVALID_PARAMETER,
    APP_MANAGER_ERROR_OUT_OF_MEMORY = TIZEN_ERROR_OUT_OF_MEMORY,
    APP_MANAGER_ERROR_IO_ERROR = TIZEN_ERROR_IO_ERROR,
    APP_MANAGER_ERROR_NO_SUCH_APP = -0x01110000 | 0x01
} app_manager_error_e;

/**
 * The directory of an application's resources that other applications may read.
 * @param[out] path absolute, ends with "/"; to be freed with free(); untouched on error
 * @return APP_MANAGER_ERROR_NONE; NO_SUCH_APP when it is not installed (an empty id too); INVALID_PARAMETER
 *         for NULL; OUT_OF_MEMORY; IO_ERROR when the device cannot be read
 */
int app_manager_get_shared_resource_path(const char* app_id, char** path);

#ifdef __cplusplus
}
#endif
