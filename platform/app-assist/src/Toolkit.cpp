#include "Toolkit.h"

#include "Guarded.h"

#include <device/ToolkitFiles.h>

#include <Efreet.h>
#include <Elementary.h>

#include <cstdarg>
#include <cstdio>
#include <cstdlib>

namespace app_assist {

namespace {

void writeToLog(const Eina_Log_Domain* domain, Eina_Log_Level level, const char*, const char* function, int line,
                const char* format, void*, va_list arguments) {
    if (level > EINA_LOG_LEVEL_ERR)
        return;
    char* message = nullptr;
    if (vasprintf(&message, format, arguments) < 0)
        return;
    dlog_print(level == EINA_LOG_LEVEL_ERR ? DLOG_WARN : DLOG_ERROR, "EFL", "%s: %s(%d) > %s", domain->name, function,
               line, message);
    std::free(message);
}

}  // namespace

Toolkit::Toolkit(const device::Device& device, Messages messages, int argc, char** argv) : messages_(messages) {
    device::keepToolkitFilesIn(device.folder());
    // The desktop's services and its icon and menu caches are not the device's. They would cost most of the start,
    // and leave a daemon behind.
    ecore_app_no_system_modules();
    efreet_cache_disable();
    // The profile with touch scrolling.
    setenv("ELM_PROFILE", "mobile", 1);
    eina_init();
    if (messages_ == Messages::InLog)
        eina_log_print_cb_set(writeToLog, nullptr);
    elm_init(argc, argv);
    elm_config_scale_set(device.screen().scale);
    // A device has no mouse pointer. EFL makes a picture of one for every text, and leaves a part of it behind.
    elm_config_cursor_engine_only_set(EINA_TRUE);
}

Toolkit::~Toolkit() {
    // Deletions that wait for the next turn of the loop happen now.
    ecore_main_loop_iterate();
    elm_shutdown();
    if (messages_ == Messages::InLog)
        eina_log_print_cb_set(eina_log_print_cb_stderr, nullptr);
    eina_shutdown();
}

}  // namespace app_assist
