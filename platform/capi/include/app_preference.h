#pragma once

#include "tizen_error.h"

#ifdef __cplusplus
extern "C" {
#endif

typedef enum {
    PREFERENCE_ERROR_NONE = TIZEN_ERROR_NONE,
    PREFERENCE_ERROR_INVALID_PARAMETER = TIZEN_ERROR_INVALID_PARAMETER,
    PREFERENCE_ERROR_OUT_OF_MEMORY = TIZEN_ERROR_OUT_OF_MEMORY,
    PREFERENCE_ERROR_NO_KEY = TIZEN_ERROR_KEY_NOT_AVAILABLE,
    PREFERENCE_ERROR_IO_ERROR = TIZEN_ERROR_IO_ERROR
} preference_error_e;

/**
 * Stores a string in the calling application's preferences; an old value is replaced. A value that could not be
 * written is tried again before the next one and at the application's end. When more than 4 MiB could not be written,
 * all of that is given up, and every further call fails.
 * @return PREFERENCE_ERROR_NONE; INVALID_PARAMETER for a NULL argument; OUT_OF_MEMORY; IO_ERROR when it could not
 *         be written
 */
int preference_set_string(const char* key, const char* value);

/**
 * Reads a string from the calling application's preferences.
 * @param[out] value to be freed with free(); untouched on error
 * @return PREFERENCE_ERROR_NONE; NO_KEY when it was never set; INVALID_PARAMETER for NULL; OUT_OF_MEMORY; IO_ERROR
 *         when the device cannot be read
 */
int preference_get_string(const char* key, char** value);

/**
 * Removes all preferences of the calling application.
 * @return PREFERENCE_ERROR_NONE; OUT_OF_MEMORY; IO_ERROR when they could not be removed
 */
int preference_remove_all(void);

#ifdef __cplusplus
}
#endif
