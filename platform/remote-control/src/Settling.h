#pragma once

#include <Ecore.h>
#include <Evas.h>

#include <functional>

namespace remote_control {

class ScrollWatch;

/// Waits until a canvas has come to rest: no frame drawn for 0.15 s though what moves had its turns, nothing left to do
/// and nothing scrolling, or 3 s have passed. Then calls `done` once, from the main loop. Destroyed before, or when the
/// canvas goes, it calls nothing.
class Settling {
public:
    /// `scrolls` outlives this object.
    Settling(Evas* canvas, const ScrollWatch& scrolls, std::function<void()> done);
    ~Settling();
    Settling(const Settling&) = delete;
    Settling& operator=(const Settling&) = delete;

private:
    static void onFrameBegin(void* data, Evas* canvas, void* info);
    static void onFrameEnd(void* data, Evas* canvas, void* info);
    static void onCanvasFree(void* data, Evas* canvas, void* info);
    static Eina_Bool onTick(void* data);
    static Eina_Bool onQuiet(void* data);
    static Eina_Bool onIdle(void* data);
    static Eina_Bool onDeadline(void* data);
    void waitForQuiet();
    void leave();
    void finish();

    Evas* canvas_;
    const ScrollWatch& scrolls_;
    std::function<void()> done_;
    Ecore_Timer* quiet_ = nullptr;
    Ecore_Timer* deadline_ = nullptr;
    Ecore_Animator* ticker_ = nullptr;
    int ticks_ = 0;  ///< turns of what moves since the last frame
    Ecore_Idler* idle_ = nullptr;
    bool drawing_ = false;
};

}  // namespace remote_control
