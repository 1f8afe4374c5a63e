#include "dlog.h"

#include "Service.h"

#include <algorithm>
#include <cstdarg>
#include <cstdio>

namespace {

constexpr int failed = -1;

/// Throws std::bad_alloc; "" with `length` < 0 when the format cannot be filled in.
std::string formatted(const char* format, va_list arguments, int& length) {
    va_list again;
    va_copy(again, arguments);
    char shortText[512];
    length = std::vsnprintf(shortText, sizeof shortText, format, arguments);
    std::string text;
    if (length >= 0 && static_cast<std::size_t>(length) < sizeof shortText) {
        text.assign(shortText, static_cast<std::size_t>(length));
    } else if (length >= 0) {
        text.resize(static_cast<std::size_t>(length) + 1);
        length = std::vsnprintf(text.data(), text.size(), format, again);
        text.pop_back();
    }
    va_end(again);
    return text;
}

int print(log_priority priority, const char* tag, const char* format, va_list arguments) {
    if (!format)
        return failed;
    int length = 0;
    const std::string text = formatted(format, arguments, length);
    const auto level = static_cast<device::Log::Level>(std::clamp<int>(priority, DLOG_DEBUG, DLOG_FATAL));
    if (length < 0 || !device::Device::current().log().write(level, tag ? tag : "", text))
        return failed;
    return length;
}

/// A function of its own: an array of arguments, which va_list is, cannot be handed on as one.
int printOnDevice(log_priority priority, const char* tag, const char* format, va_list arguments) {
    int result = failed;
    service::callOnDevice("dlog_print", [&](device::Device&) {
        result = print(priority, tag, format, arguments);
        return TIZEN_ERROR_NONE;
    });
    return result;
}

}  // namespace

int dlog_print(log_priority prio, const char* tag, const char* fmt, ...) {
    va_list arguments;
    va_start(arguments, fmt);
    const int result = printOnDevice(prio, tag, fmt, arguments);
    va_end(arguments);
    return result;
}
