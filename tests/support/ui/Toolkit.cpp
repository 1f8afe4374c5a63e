#include "ui/Toolkit.h"

#include "ui/Clock.h"

#include <Ecore_Evas.h>
#include <Efreet.h>
#include <Elementary.h>

#include <cstdlib>

namespace test_ui {

namespace {

void deleteWindows() {
    Eina_List* frames = ecore_evas_ecore_evas_list_get();
    void* frame = nullptr;
    EINA_LIST_FREE(frames, frame) {
        Evas_Object* window =
            elm_object_top_widget_get(evas_object_bottom_get(ecore_evas_get(static_cast<Ecore_Evas*>(frame))));
        if (window)
            evas_object_del(window);
    }
}

}  // namespace

Toolkit::Toolkit() {
    setenv("ELM_ENGINE", "buffer", 1);
    setenv("ELM_PROFILE", "mobile", 1);
    setenv("ELM_CONFIG_DIR_XDG", "1", 1);
    setenv("EINA_LOG_BACKTRACE", "-1", 1);
    // Otherwise frames are drawn by a thread in its own time.
    setenv("ECORE_EVAS_FORCE_SYNC_RENDER", "1", 1);
    for (const char* outer : {"DISPLAY", "WAYLAND_DISPLAY", "DBUS_SESSION_BUS_ADDRESS", "LANGUAGE", "LC_ALL"})
        unsetenv(outer);
    setenv("LANG", "C.UTF-8", 1);

    clock::start();
    ecore_app_no_system_modules();
    efreet_cache_disable();
    elm_init(0, nullptr);
    elm_config_cursor_engine_only_set(EINA_TRUE);
    log_.emplace();
    clock::driveMainLoop();
}

Toolkit::~Toolkit() {
    deleteWindows();
    ecore_main_loop_iterate();
    clock::stop();
    log_.reset();
    elm_shutdown();
}

}  // namespace test_ui
