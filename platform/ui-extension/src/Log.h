#pragma once

#include <dlog.h>

#include <exception>
#include <utility>

namespace uxt {

inline constexpr char logTag[] = "UXT";

/// Runs what a C caller asked for: no exception may travel into C. One that comes is an error line in the log, and
/// the call answers `otherwise`.
template <typename Result, typename Function>
Result guarded(const char* function, Result otherwise, Function&& body) noexcept {
    try {
        return body();
    } catch (const std::exception& error) {
        dlog_print(DLOG_ERROR, logTag, "%s: %s", function, error.what());
    } catch (...) {
        dlog_print(DLOG_ERROR, logTag, "%s: unknown exception", function);
    }
    return otherwise;
}

template <typename Function>
void guarded(const char* function, Function&& body) noexcept {
    guarded(function, false, [&body] {
        body();
        return true;
    });
}

}  // namespace uxt
