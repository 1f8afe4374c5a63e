#pragma once

#include "tizen_error.h"

#ifdef __cplusplus
extern "C" {
#endif

typedef enum {
    PACKAGE_MANAGER_ERROR_NONE = TIZEN_ERROR_NONE,
    PACKAGE_MANAGER_ERROR_INVALID_PARAMETER = TIZEN_ERROR_INVALID_PARAMETER,
    PACKAGE_MANAGER_ERROR_OUT_OF_MEMORY = TIZEN_ERROR_OUT_OF_MEMORY,
    PACKAGE_MANAGER_ERROR_IO_ERROR = TIZEN_ERROR_IO_ERROR,
    PACKAGE_MANAGER_ERROR_NO_SUCH_PACKAGE = -0x01150000 | 0x71
} package_manager_error_e;

/** What is known of one installed package. Opaque. */
typedef struct package_info_s* package_info_h;

/**
 * Looks an installed package up.
 * @param[out] info to be freed with package_info_destroy(); set to NULL on error
 * @return PACKAGE_MANAGER_ERROR_NONE; NO_SUCH_PACKAGE; INVALID_PARAMETER for NULL; OUT_OF_MEMORY; IO_ERROR
 *         (also for a broken manifest)
 */
int package_info_create(const char* package, package_info_h* info);

/** Frees a handle. @return PACKAGE_MANAGER_ERROR_NONE; INVALID_PARAMETER for NULL (which does no harm) */
int package_info_destroy(package_info_h info);

/**
 * Gives the package's version.
 * @param[out] version possibly empty; to be freed with free(); untouched on error
 * @return PACKAGE_MANAGER_ERROR_NONE; INVALID_PARAMETER for NULL; OUT_OF_MEMORY
 */
int package_info_get_version(package_info_h info, char** version);

/**
 * Gives the path of the icon of the package's application.
 * @param[out] path absolute, of a file that need not exist; NULL when the package names none; to be freed with
 *             free(); untouched on error
 * @return PACKAGE_MANAGER_ERROR_NONE; INVALID_PARAMETER for NULL; OUT_OF_MEMORY
 */
int package_info_get_icon(package_info_h info, char** path);

/**
 * Gives the name of the package's application, for people: in the display language where the manifest has it in that.
 * @param[out] label the package's id where the manifest gives none; to be freed with free(); untouched on error
 * @return PACKAGE_MANAGER_ERROR_NONE; INVALID_PARAMETER for NULL; OUT_OF_MEMORY; IO_ERROR when the device's display
 *         language cannot be read
 */
int package_info_get_label(package_info_h info, char** label);

#ifdef __cplusplus
}
#endif
