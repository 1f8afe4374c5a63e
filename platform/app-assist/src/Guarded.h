#pragma once

#include <dlog.h>

#include <exception>

namespace app_assist {

inline constexpr char logTag[] = "APP_ASSIST";

/// Runs what EFL calls: no exception may travel through a C library. One that comes is an error line in the log.
template <typename Function>
void guarded(const char* what, Function&& function) noexcept {
    try {
        function();
    } catch (const std::exception& error) {
        dlog_print(DLOG_ERROR, logTag, "%s failed: %s", what, error.what());
    } catch (...) {
        dlog_print(DLOG_ERROR, logTag, "%s failed with an unknown exception", what);
    }
}

}  // namespace app_assist
