#pragma once

#include "tizen_error.h"

#ifdef __cplusplus
extern "C" {
#endif

typedef enum {
    SYSTEM_SETTINGS_ERROR_NONE = TIZEN_ERROR_NONE,
    SYSTEM_SETTINGS_ERROR_INVALID_PARAMETER = TIZEN_ERROR_INVALID_PARAMETER,
    SYSTEM_SETTINGS_ERROR_OUT_OF_MEMORY = TIZEN_ERROR_OUT_OF_MEMORY,
    SYSTEM_SETTINGS_ERROR_IO_ERROR = TIZEN_ERROR_IO_ERROR,
    SYSTEM_SETTINGS_ERROR_NOT_SUPPORTED = TIZEN_ERROR_NOT_SUPPORTED
} system_settings_error_e;

/** The settings that this device answers; the numbers are the interface's own. */
typedef enum {
    SYSTEM_SETTINGS_KEY_LOCALE_COUNTRY = 12, /**< country code, "" when the device sets none */
    SYSTEM_SETTINGS_KEY_LOCALE_LANGUAGE = 13 /**< display language without a codeset, for example "ko_KR" */
} system_settings_key_e;

/**
 * Reads a string setting.
 * @param[out] value to be freed with free(); untouched on error
 * @return SYSTEM_SETTINGS_ERROR_NONE; NOT_SUPPORTED for another key; INVALID_PARAMETER for NULL; OUT_OF_MEMORY;
 *         IO_ERROR when the device cannot be read
 */
int system_settings_get_value_string(system_settings_key_e key, char** value);

#ifdef __cplusplus
}
#endif
