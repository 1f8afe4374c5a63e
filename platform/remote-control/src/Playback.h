#pragma once

#include <Ecore.h>

#include <functional>
#include <memory>
#include <vector>

namespace remote_control {

/// Carries out steps from the main loop, each a while after the one before it, then says that it is done.
/// Destroyed before, it leaves the remaining steps out and says nothing.
class Playback {
public:
    struct Step {
        double after;  ///< seconds
        std::function<void()> run;
    };

    Playback(std::vector<Step> steps, std::function<void()> done);
    ~Playback();
    Playback(const Playback&) = delete;
    Playback& operator=(const Playback&) = delete;

private:
    static Eina_Bool onTimer(void* data);
    void waitForNext();

    std::vector<Step> steps_;
    std::size_t next_ = 0;
    std::function<void()> done_;
    Ecore_Timer* timer_ = nullptr;
    std::shared_ptr<bool> alive_ = std::make_shared<bool>(true);
};

}  // namespace remote_control
