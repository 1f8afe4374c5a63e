#pragma once

#include <Evas.h>

#include <functional>

namespace app_assist {

/// The keys that stand for the device's back key, taken from whatever has the focus: a read-only text that has it
/// would swallow them.
class BackKeys {
public:
    /// Calls `pressed` from now on. `canvas` may go first.
    BackKeys(Evas* canvas, std::function<void()> pressed);
    ~BackKeys();
    BackKeys(const BackKeys&) = delete;
    BackKeys& operator=(const BackKeys&) = delete;

private:
    static void keyDown(void* keys, Evas*, Evas_Object*, void* event);
    static void ownerGone(void* keys, Evas*, Evas_Object*, void*);

    std::function<void()> pressed_;
    /// Draws nothing; keys are given to an object.
    Evas_Object* owner_;
};

}  // namespace app_assist
