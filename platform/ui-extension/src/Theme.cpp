#include "uxt/Theme.h"

#include "Appearance.h"
#include "ChangedCallbacks.h"
#include "Log.h"

#include <device/Device.h>

#include <Elementary.h>

#include <string>

namespace uxt {
namespace {

bool isOverlay(const std::string& file) {
    const Eina_List* node = nullptr;
    void* each = nullptr;
    EINA_LIST_FOREACH(elm_theme_overlay_list_get(nullptr), node, each) {
        if (file == static_cast<const char*>(each))
            return true;
    }
    return false;
}

}  // namespace

void applyDeviceTheme(bool dark) {
    guarded("applyDeviceTheme", [dark] {
        const std::string file = device::Device::current().data() / "device.edj";
        // The toolkit takes a file that it cannot read without a word, so this comes first.
        DeviceColours colours = DeviceColours::read(file);
        if (!isOverlay(file))
            elm_theme_overlay_add(nullptr, file.c_str());
        Appearance::ofProcess().setDevice(std::move(colours), dark);
    });
}

void themeChanged() {
    guarded("themeChanged", [] {
        Appearance::ofProcess().refresh();
        ChangedCallbacks::ofProcess().call();
    });
}

}  // namespace uxt
