#pragma once

#include <dlog.h>

#include <cstring>

/// The tag of every line that the application writes to the platform's log.
#define KEST_LOG_TAG "KEST"

/// The source file's name without its folders, as it stands in the log.
inline const char* kestLogFileName(const char* path) {
    const char* slash = std::strrchr(path, '/');
    return slash ? slash + 1 : path;
}

#define KEST_LOG_COLOR_GREEN "\e[0;32m"
#define KEST_LOG_COLOR_BLUE "\e[0;34m"
#define KEST_LOG_COLOR_MAGENTA "\e[0;35m"
#define KEST_LOG_COLOR_RED "\e[0;31m"
#define KEST_LOG_COLOR_END "\e[0;m"

#define KEST_LOG_WRITE(priority, format, ...)                                                                          \
    dlog_print(priority, KEST_LOG_TAG, "%s: %s(%d) > " format, kestLogFileName(__FILE__), __func__, __LINE__,          \
               ##__VA_ARGS__)

/// Entry trace, where a function's start is worth a line.
#define KEST_BEGIN() KEST_LOG_WRITE(DLOG_INFO, KEST_LOG_COLOR_GREEN "BEGIN >>>>" KEST_LOG_COLOR_END)
/// Trace of a callback or of an access to the cache.
#define KEST_HIT() KEST_LOG_WRITE(DLOG_INFO, KEST_LOG_COLOR_BLUE ">>>HIT<<<" KEST_LOG_COLOR_END)
#define KEST_INFO(format, ...) KEST_LOG_WRITE(DLOG_INFO, format, ##__VA_ARGS__)
#define KEST_WARN(format, ...)                                                                                         \
    KEST_LOG_WRITE(DLOG_WARN, KEST_LOG_COLOR_MAGENTA format KEST_LOG_COLOR_END, ##__VA_ARGS__)
#define KEST_ERR(format, ...)                                                                                          \
    KEST_LOG_WRITE(DLOG_ERROR, KEST_LOG_COLOR_RED "* Critical * " format KEST_LOG_COLOR_END, ##__VA_ARGS__)

extern "C" {
/// The C library's own end of a failed assertion. Declared here, as <cassert> hides it in a release build, where a
/// broken invariant is as fatal as in any other.
extern void __assert_fail(const char* assertion, const char* file, unsigned int line, const char* function) noexcept
    __attribute__((noreturn));
}

#define KEST_ASSERT_FAIL(text) __assert_fail(text, __FILE__, __LINE__, static_cast<const char*>(__func__))

/// Ends the process when an invariant is broken; `conditionText` is what the assertion failure quotes, the rest is
/// the error line's message.
#define WASSERT_EX(condition, conditionText, format, ...)                                                              \
    do {                                                                                                               \
        if (!(condition)) {                                                                                            \
            KEST_ERR("WASSERT! " format, ##__VA_ARGS__);                                                               \
            KEST_ASSERT_FAIL(conditionText);                                                                           \
        }                                                                                                              \
    } while (false)

/// The same, with the condition itself as the message.
#define WASSERT(condition) WASSERT_EX(condition, "(" #condition ")", "%s", #condition)
