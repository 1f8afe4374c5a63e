#pragma once

#include <Elementary.h>

namespace app_assist {

/// Gives a window the size of the device's display, for good.
void fitToDisplay(Evas_Object* window);

/// The window that is made ahead of the application's start, so that it is there when the application asks for it.
/// One a process; handed out once by app_get_preinitialized_window(), deleted at the end when nobody took it.
class PreinitializedWindow {
public:
    /// Makes it; where that cannot be done there is none to hand out.
    PreinitializedWindow();
    ~PreinitializedWindow();
    PreinitializedWindow(const PreinitializedWindow&) = delete;
    PreinitializedWindow& operator=(const PreinitializedWindow&) = delete;

    bool exists() const { return window_; }

    /// The process's; null outside its life.
    static PreinitializedWindow* current();
    /// Hands it out under that name; null when it is gone.
    Evas_Object* take(const char* name);

private:
    static void deleted(void* self, Evas*, Evas_Object*, void*);

    Evas_Object* window_;
};

}  // namespace app_assist
