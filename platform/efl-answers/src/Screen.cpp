#include <device/Device.h>

#include <Elementary.h>

#include <exception>

namespace {

const device::Screen& deviceScreen() {
    try {
        return device::Device::current().screen();
    } catch (const std::exception&) {
        // Without a device, the display that a fresh one has.
        return device::Screen::named("");
    }
}

}  // namespace

/// EFL reports the monitor of the workstation, or a display of one pixel where it draws into memory. The device's
/// display is what its profile says, whatever shows it.
extern "C" void elm_win_screen_size_get(const Evas_Object*, int* x, int* y, int* width, int* height) {
    const device::Screen& screen = deviceScreen();
    if (x)
        *x = 0;
    if (y)
        *y = 0;
    if (width)
        *width = screen.width;
    if (height)
        *height = screen.height;
}
