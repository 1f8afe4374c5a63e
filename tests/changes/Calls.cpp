#include "Calls.h"

#include <Elementary.h>
#include <dlog.h>

#include <cstdarg>
#include <cstdio>
#include <string_view>
#include <utility>

namespace {

std::vector<calls::Line> lines;
int presses = 0;

void countPress(void*, Evas_Object*, const char*, const char*) {
    ++presses;
}

std::string formatted(const char* format, va_list arguments) {
    va_list again;
    va_copy(again, arguments);
    std::string text(static_cast<std::size_t>(std::vsnprintf(nullptr, 0, format, arguments)), '\0');
    std::vsnprintf(text.data(), text.size() + 1, format, again);
    va_end(again);
    return text;
}

char levelOf(log_priority priority) {
    return priority >= DLOG_ERROR ? 'E' : priority == DLOG_WARN ? 'W' : 'I';
}

/// Without the line's number, its colours and the word that goes with red.
std::string readable(const std::string& text) {
    const auto arrow = text.find(") > ");
    if (arrow == std::string::npos)
        return text;
    const std::string place = text.substr(0, text.rfind('(', arrow));
    std::string message = text.substr(arrow + 4);
    for (const std::string_view noise : {"\x1b[0;31m", "\x1b[0;32m", "\x1b[0;34m", "\x1b[0;35m", "* Critical * "})
        if (message.starts_with(noise))
            message.erase(0, noise.size());
    if (message.ends_with("\x1b[0;m"))
        message.resize(message.size() - std::string_view("\x1b[0;m").size());
    return place + " > " + message;
}

}  // namespace

std::vector<calls::Line> calls::newLines() {
    return std::exchange(lines, {});
}

int calls::newPresses() {
    return std::exchange(presses, 0);
}

extern "C" {

int __real_dlog_print(log_priority priority, const char* tag, const char* format, ...);
int __wrap_dlog_print(log_priority priority, const char* tag, const char* format, ...);
void __real_edje_object_signal_callback_add(Evas_Object* object, const char* emission, const char* source,
                                            Edje_Signal_Cb function, void* data);
void __wrap_edje_object_signal_callback_add(Evas_Object* object, const char* emission, const char* source,
                                            Edje_Signal_Cb function, void* data);

int __wrap_dlog_print(log_priority priority, const char* tag, const char* format, ...) {
    va_list arguments;
    va_start(arguments, format);
    const std::string text = formatted(format, arguments);
    va_end(arguments);
    lines.push_back({levelOf(priority), readable(text)});
    return __real_dlog_print(priority, tag, "%s", text.c_str());
}

void __wrap_edje_object_signal_callback_add(Evas_Object* object, const char* emission, const char* source,
                                            Edje_Signal_Cb function, void* data) {
    __real_edje_object_signal_callback_add(object, emission, source, function, data);
    if (std::string_view(emission) == "reply,pressed")
        __real_edje_object_signal_callback_add(object, emission, source, countPress, nullptr);
}
}
