#pragma once

namespace device {

/// Has EFL's main loop ready in this process, for whoever uses it without a window; free when it is ready already.
/// It stays until the process ends: EFL does not bear being ended and begun again while child processes come and go.
/// Throws Error when EFL cannot be started.
void startMainLoop();

}  // namespace device
