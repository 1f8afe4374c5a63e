#pragma once

#include "Playback.h"
#include "ScrollWatch.h"
#include "Settling.h"

#include <Evas.h>

#include <deque>
#include <functional>
#include <memory>
#include <string>
#include <vector>

namespace remote_control {

/// Does to a screen what it is asked to, one action after the other, so that two callers never have a finger each
/// on the same screen. Each action ends when the screen has settled after it.
class ActionQueue {
public:
    struct Action {
        /// Makes the steps when the action's turn has come; may throw device::Error.
        std::function<std::vector<Playback::Step>(Evas* canvas)> steps;
        /// Told once how it ended: an empty text, or what went wrong.
        std::function<void(const std::string& error)> done;
    };

    /// `canvas` gives the canvas of the moment; it throws device::Error when there is none.
    explicit ActionQueue(std::function<Evas*()> canvas) : canvasOfNow_(std::move(canvas)) {}
    /// An action whose steps were all carried out ends well, the others end with an error.
    ~ActionQueue();
    ActionQueue(const ActionQueue&) = delete;
    ActionQueue& operator=(const ActionQueue&) = delete;

    void add(Action action);

private:
    static void onCanvasFree(void* data, Evas* canvas, void* info);
    void begin();
    void settle();
    void end(const std::string& error);
    void forgetCanvas();

    std::function<Evas*()> canvasOfNow_;
    std::deque<Action> actions_;  ///< the first one is under way
    Evas* canvas_ = nullptr;
    std::unique_ptr<ScrollWatch> scrolls_;
    std::unique_ptr<Playback> playback_;
    std::unique_ptr<Settling> settling_;
};

}  // namespace remote_control
