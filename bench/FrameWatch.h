#pragma once

#include "Measure.h"

#include <Evas.h>

#include <functional>
#include <vector>

namespace bench {

/// Measures what each frame of a canvas costs the main loop: all that it does from one frame to the next, waits left
/// out. Frames in which nothing changed count to the next one. There is one.
class FrameWatch {
public:
    static FrameWatch& get();

    /// Watches the first canvas that it is told of.
    void watch(Evas* canvas);
    Evas* canvas() const { return canvas_; }

    /// Forgets the frames up to now; what is done from now on counts to the first one.
    void forget();
    const std::vector<Cost>& frames() const { return frames_; }

    /// Asked before each frame; from the first one on of which it was so, `wasDrawn` is true.
    void lookFor(std::function<bool()> isSo);
    bool wasDrawn() const { return drawnFrame_ > 0; }
    /// Which frame that was since the last forget(), from 1, and when it was complete.
    int drawnFrame() const { return drawnFrame_; }
    const Cost& drawnTime() const { return drawnTime_; }

private:
    void frameEnds();

    Evas* canvas_ = nullptr;
    Cost before_;
    std::vector<Cost> frames_;
    std::function<bool()> isSo_;
    bool isIn_ = false;
    int drawnFrame_ = 0;
    Cost drawnTime_;
};

}  // namespace bench
