#include "device/MainLoop.h"

#include "device/Error.h"

#include <Ecore.h>

#include <cstdlib>

namespace device {

void startMainLoop() {
    // Ecore's system modules report battery and time zone over the system bus; where there is none they complain.
    static const bool started = setenv("ECORE_NO_SYSTEM_MODULES", "1", 0) == 0 && ecore_init() > 0;
    if (!started)
        throw Error("EFL's main loop cannot be started; check the installation of EFL");
}

}  // namespace device
