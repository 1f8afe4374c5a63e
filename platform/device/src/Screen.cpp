#include "device/Screen.h"

namespace device {

const std::vector<Screen>& Screen::all() {
    static const std::vector<Screen> screens{
        {"720x1280", 720, 1280, 2.6, ""},
        {"480x800", 480, 800, 1.7, "LDPI"},
    };
    return screens;
}

const Screen& Screen::named(std::string_view name) {
    for (const Screen& screen : all())
        if (screen.name == name)
            return screen;
    return all().front();
}

}  // namespace device
