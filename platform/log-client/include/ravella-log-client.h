#pragma once

#include "bundle.h"

#ifdef __cplusplus
extern "C" {
#endif

/** A connection to the device's usage-log service. Opaque. */
typedef struct ravella_log_manager_s* ravella_log_manager_h;

/**
 * Told, from the main loop, that a record was stored.
 * @param request_id what ravella_log_manager_insert() gave
 * @param result TIZEN_ERROR_NONE or why it was not stored
 */
typedef void (*ravella_log_insert_cb)(int request_id, int result, void* user_data);

/**
 * Connects to the service.
 * @param[out] handle to be freed with ravella_log_manager_destroy(); untouched on error
 * @return TIZEN_ERROR_NONE; INVALID_PARAMETER for NULL; OUT_OF_MEMORY; IO_ERROR when the device cannot be opened
 */
int ravella_log_manager_create(ravella_log_manager_h* handle);

/**
 * Stores a record; it is on the device when this returns 0.
 * @param uri a content URI; its scheme must be "content://"
 * @param record its strings are copied
 * @param callback may be NULL; not called when the handle is destroyed before the main loop comes to it
 * @param[out] request_id number of this record, which the callback gets too; may be NULL; untouched on error
 * @return TIZEN_ERROR_NONE; INVALID_PARAMETER for a NULL handle or record or another URI; OUT_OF_MEMORY; IO_ERROR when
 *         the record could not be written
 */
int ravella_log_manager_insert(ravella_log_manager_h handle, const char* uri, bundle* record,
                               ravella_log_insert_cb callback, void* user_data, int* request_id);

/**
 * Frees the handle; callbacks that have not come yet do not come any more. Allowed from inside a callback.
 * @return TIZEN_ERROR_NONE; INVALID_PARAMETER for NULL (which does no harm)
 */
int ravella_log_manager_destroy(ravella_log_manager_h handle);

#ifdef __cplusplus
}
#endif
