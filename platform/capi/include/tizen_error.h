#pragma once

#include <errno.h>

/** Result codes that the native services share: 0 or a negative number. */
typedef enum {
    TIZEN_ERROR_NONE = 0,
    TIZEN_ERROR_INVALID_PARAMETER = -EINVAL,
    TIZEN_ERROR_OUT_OF_MEMORY = -ENOMEM,
    TIZEN_ERROR_IO_ERROR = -EIO,
    TIZEN_ERROR_NO_SUCH_FILE = -ENOENT,
    TIZEN_ERROR_PERMISSION_DENIED = -EACCES,
    TIZEN_ERROR_KEY_NOT_AVAILABLE = -ENOKEY,
    TIZEN_ERROR_NO_DATA = -ENODATA,
    TIZEN_ERROR_NOT_SUPPORTED = -EOPNOTSUPP
} tizen_error_e;
