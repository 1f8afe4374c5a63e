#pragma once

namespace app_assist {

class WView;

/// The timers that run, as the rest of the framework sees them.
class UiTimers {
public:
    /// Ends every timer of a view that goes.
    static void endOf(const WView* view);
    /// Ends every timer: the main loop is about to go.
    static void endAll();
};

}  // namespace app_assist
