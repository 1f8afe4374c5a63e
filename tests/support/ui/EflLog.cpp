#include "ui/EflLog.h"

#include <Eina.h>
#include <gtest/gtest.h>

#include <algorithm>
#include <cstdarg>
#include <cstdio>
#include <memory>
#include <mutex>

namespace test_ui {

struct EflLog::State {
    mutable std::mutex mutex;  // EFL's threads log too
    std::vector<std::string> lines;
    std::vector<std::string> expected;
};

namespace {

/// What EFL says of pages that are in order. Each with the reason why it is no error.
const char* const harmless[] = {
    // A page without anything that takes the focus has no node in the focus manager at the end of its transition.
    "Could not fetch a node located at",
    // A window that goes with a widget that can take the focus looks for the next one up to its own frame.
    "func 'efl_ui_widget_parent_get' (",
};

bool contains(const std::string& line, const std::string& text) {
    return line.find(text) != std::string::npos;
}

bool isHarmless(const std::string& line) {
    return std::any_of(std::begin(harmless), std::end(harmless),
                       [&](const char* text) { return contains(line, text); });
}

std::string formatted(const char* format, va_list arguments) {
    va_list copy;
    va_copy(copy, arguments);
    const int length = std::vsnprintf(nullptr, 0, format, copy);
    va_end(copy);
    std::string text(length > 0 ? static_cast<size_t>(length) : 0, '\0');
    std::vsnprintf(text.data(), text.size() + 1, format, arguments);
    return text;
}

void keep(const Eina_Log_Domain*, Eina_Log_Level level, const char*, const char* function, int, const char* format,
          void* data, va_list arguments) {
    if (level > EINA_LOG_LEVEL_ERR)
        return;
    auto& state = *static_cast<EflLog::State*>(data);
    const std::string line = std::string(function) + ": " + formatted(format, arguments);
    const std::lock_guard lock(state.mutex);
    if (!isHarmless(line))
        state.lines.push_back(line);
}

}  // namespace

EflLog::EflLog() : state_(new State) {
    eina_log_print_cb_set(keep, state_);
}

EflLog::~EflLog() {
    eina_log_print_cb_set(eina_log_print_cb_stderr, nullptr);
    const std::unique_ptr<State> state(state_);
    for (const std::string& line : state->lines) {
        const auto expectsIt = [&](const std::string& text) { return contains(line, text); };
        if (std::none_of(state->expected.begin(), state->expected.end(), expectsIt))
            ADD_FAILURE() << "unexpected line of EFL: " << line;
    }
    for (const std::string& text : state->expected) {
        const auto holdsIt = [&](const std::string& line) { return contains(line, text); };
        if (std::none_of(state->lines.begin(), state->lines.end(), holdsIt))
            ADD_FAILURE() << "EFL did not say: " << text;
    }
}

void EflLog::expect(const std::string& text) {
    state_->expected.push_back(text);
}

std::vector<std::string> EflLog::lines() const {
    const std::lock_guard lock(state_->mutex);
    return state_->lines;
}

}  // namespace test_ui
