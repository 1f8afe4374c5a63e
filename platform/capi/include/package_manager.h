#pragma once

#include "package_info.h"

#ifdef __cplusplus
extern "C" {
#endif

/** A subscription to package events. Opaque. */
typedef struct package_manager_s* package_manager_h;

typedef enum {
    PACKAGE_MANAGER_EVENT_TYPE_INSTALL = 0,
    PACKAGE_MANAGER_EVENT_TYPE_UNINSTALL,
    PACKAGE_MANAGER_EVENT_TYPE_UPDATE
} package_manager_event_type_e;

typedef enum {
    PACKAGE_MANAGER_EVENT_STATE_STARTED = 0,
    PACKAGE_MANAGER_EVENT_STATE_PROCESSING,
    PACKAGE_MANAGER_EVENT_STATE_COMPLETED,
    PACKAGE_MANAGER_EVENT_STATE_FAILED
} package_manager_event_state_e;

/**
 * Told of a package event, from the main loop. The strings live as long as the call lasts.
 * @param type always "tpk"
 * @param package id of the package that the event is about
 * @param progress percent
 * @param error PACKAGE_MANAGER_ERROR_NONE unless event_state is FAILED
 */
typedef void (*package_manager_event_cb)(const char* type, const char* package, package_manager_event_type_e event_type,
                                         package_manager_event_state_e event_state, int progress,
                                         package_manager_error_e error, void* user_data);

/**
 * Makes a subscription that is told of nothing yet.
 * @param[out] manager to be freed with package_manager_destroy(); untouched on error
 * @return PACKAGE_MANAGER_ERROR_NONE; INVALID_PARAMETER for NULL; OUT_OF_MEMORY
 */
int package_manager_create(package_manager_h* manager);

/**
 * Ends the subscription and frees the handle; allowed from inside its callback.
 * @return PACKAGE_MANAGER_ERROR_NONE; INVALID_PARAMETER for NULL (which does no harm)
 */
int package_manager_destroy(package_manager_h manager);

/**
 * Has `callback` called from the main loop for every package event of the device; replaces an earlier one.
 * @return PACKAGE_MANAGER_ERROR_NONE; INVALID_PARAMETER for a NULL handle or callback; OUT_OF_MEMORY; IO_ERROR when
 *         the device cannot be opened
 */
int package_manager_set_event_cb(package_manager_h manager, package_manager_event_cb callback, void* user_data);

/**
 * Has the callback called no more; allowed from inside it, and where none is set.
 * @return PACKAGE_MANAGER_ERROR_NONE; INVALID_PARAMETER for NULL
 */
int package_manager_unset_event_cb(package_manager_h manager);

/**
 * Looks an installed package up; the same as package_info_create().
 * @param[out] info to be freed with package_info_destroy(); set to NULL on error
 * @return as package_info_create()
 */
int package_manager_get_package_info(const char* package, package_info_h* info);

#ifdef __cplusplus
}
#endif
