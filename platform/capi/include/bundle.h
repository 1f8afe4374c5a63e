#pragma once

#include "tizen_error.h"

#ifdef __cplusplus
extern "C" {
#endif

typedef enum {
    BUNDLE_ERROR_NONE = TIZEN_ERROR_NONE,
    BUNDLE_ERROR_INVALID_PARAMETER = TIZEN_ERROR_INVALID_PARAMETER,
    BUNDLE_ERROR_OUT_OF_MEMORY = TIZEN_ERROR_OUT_OF_MEMORY,
    BUNDLE_ERROR_KEY_NOT_AVAILABLE = TIZEN_ERROR_KEY_NOT_AVAILABLE,
    BUNDLE_ERROR_KEY_EXISTS = -0x01180000 | 0x01
} bundle_error_e;

/** Typed values by key; here: strings. Opaque. */
typedef struct _bundle_t bundle;

/** Makes an empty bundle. @return to be freed with bundle_free(); NULL when memory is out */
bundle* bundle_create(void);

/** Frees a bundle with its values. @return BUNDLE_ERROR_NONE; INVALID_PARAMETER for NULL (which does no harm) */
int bundle_free(bundle* b);

/**
 * Adds a string. Key and value are copied.
 * @return BUNDLE_ERROR_NONE; KEY_EXISTS (the value stays as it was); INVALID_PARAMETER for NULL or an empty key;
 *         OUT_OF_MEMORY
 */
int bundle_add_str(bundle* b, const char* key, const char* str);

/**
 * Gives the string of that key.
 * @param[out] str points into the bundle and lives as long as it; not to be freed; untouched on error
 * @return BUNDLE_ERROR_NONE; KEY_NOT_AVAILABLE when there is none; INVALID_PARAMETER for NULL or an empty key
 */
int bundle_get_str(bundle* b, const char* key, char** str);

/** @param key, value the bundle's own, as long as the call lasts */
typedef void (*bundle_str_iterator_t)(const char* key, const char* value, void* user_data);

/**
 * Calls `iterator` for each string in the order of their keys; it may add to the bundle, which it is not called for.
 * NULL for the bundle or the iterator does nothing.
 */
void bundle_foreach_str(bundle* b, bundle_str_iterator_t iterator, void* user_data);

#ifdef __cplusplus
}
#endif
