#pragma once

#include "Measure.h"

#include <Ecore.h>

#include <functional>
#include <vector>

namespace bench {

/// Measures what the main loop does between two waits for events, and runs it for a while. There is one.
class LoopWatch {
public:
    /// From one wait to the next.
    struct Turn {
        Cost cost;
        /// How often something was noted in it.
        int notes = 0;
    };

    static LoopWatch& get();

    /// From now on the loop's waits are known.
    void begin();
    /// What the loop has done up to now, the waits left out.
    Cost work() const;
    /// Marks the turn that runs.
    void note() { ++turn_.notes; }
    /// Forgets the turns up to now.
    void forgetTurns() { turns_.clear(); }
    const std::vector<Turn>& turns() const { return turns_; }

    /// Runs the loop so long.
    void runFor(double seconds);
    /// Runs the loop until it is so. False when it is not after that time.
    bool runUntil(const std::function<bool()>& isSo, double seconds);

private:
    static int wait(int count, fd_set* readable, fd_set* writable, fd_set* failed, timeval* timeout);
    void endTurn();

    Cost began_;
    Cost done_;
    Turn turn_;
    std::vector<Turn> turns_;
    std::function<bool()> isSo_;
};

}  // namespace bench
