#include "kest/KestDevice.h"

KestDevice::KestDevice() {
    kept().reset();
    kept() = std::make_unique<support::TemporaryDevice>(kest, "1.0.0");
}

std::unique_ptr<support::TemporaryDevice>& KestDevice::kept() {
    // What the device needs to go must outlive the last one.
    [[maybe_unused]] static const bool platformBegan = [] {
        device::Device::setCurrent(nullptr);
        device::faults::clear();
        return true;
    }();
    static std::unique_ptr<support::TemporaryDevice> device;
    return device;
}

void KestDevice::writeMenus(const std::vector<kest_files::Menu>& menus) const {
    support::writeFile(mainMenuFile(), kest_files::mainMenu(menus));
}

void KestDevice::writeDetail(const std::string& item, const std::string& path, const std::string& appid) const {
    support::writeFile(resources(appid) / path, kest_files::detail(item));
}

void KestDevice::writeStrings(const std::vector<kest_files::String>& strings, const std::string& path,
                              const std::string& appid) const {
    support::writeFile(resources(appid) / path, kest_files::strings(strings));
}

void KestDevice::writeTip(const std::string& item) const {
    writeMenus({{}});
    writeDetail(item);
}
