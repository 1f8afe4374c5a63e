#pragma once

#ifdef __cplusplus
extern "C" {
#endif

/** How grave a line is; the numbers are the interface's own. */
typedef enum { DLOG_DEBUG = 3, DLOG_INFO = 4, DLOG_WARN = 5, DLOG_ERROR = 6, DLOG_FATAL = 7 } log_priority;

/**
 * Writes one line to the device's main log. Longer messages are kept whole.
 * @param prio below and above what there is counts as the lowest and the highest
 * @param tag names who writes; NULL counts as ""
 * @param fmt as printf's
 * @return the number of bytes of the message, or -1 when it could not be written
 */
int dlog_print(log_priority prio, const char* tag, const char* fmt, ...) __attribute__((format(printf, 3, 4)));

#ifdef __cplusplus
}
#endif
