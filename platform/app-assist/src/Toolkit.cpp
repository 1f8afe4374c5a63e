#include "Toolkit.h"

#include "Guarded.h"

#include <Efreet.h>
#include <Elementary.h>

#include <cstdarg>
#include <cstdio>
#include <cstdlib>
#include <filesystem>
#include <string>
#include <system_error>

#include <sys/stat.h>
#include <unistd.h>

namespace app_assist {

namespace fs = std::filesystem;

namespace {

/// Of this user alone, as the run directory has to be.
bool isUsableRunFolder(const char* folder) {
    struct stat status = {};
    return folder && stat(folder, &status) == 0 && S_ISDIR(status.st_mode) && status.st_uid == geteuid() &&
           access(folder, W_OK | X_OK) == 0;
}

fs::path privateFolder(const fs::path& folder) {
    std::error_code ignored;
    fs::create_directories(folder, ignored);
    fs::permissions(folder, fs::perms::owner_all, ignored);
    return folder;
}

void keepFilesIn(const fs::path& folder) {
    setenv("XDG_CONFIG_HOME", privateFolder(folder / "config").c_str(), 1);
    setenv("XDG_CACHE_HOME", privateFolder(folder / "cache").c_str(), 1);
    setenv("ELM_CONFIG_DIR_XDG", "1", 1);
    // A good one is kept: the display's socket is in it.
    if (!isUsableRunFolder(std::getenv("XDG_RUNTIME_DIR")))
        setenv("XDG_RUNTIME_DIR", privateFolder(folder / "run").c_str(), 1);
}

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
    keepFilesIn(device.folder().toolkit());
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
