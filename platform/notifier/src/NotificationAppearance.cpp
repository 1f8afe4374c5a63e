#include "notifier/NotificationAppearance.h"

#include "device/Device.h"
#include "device/Error.h"
#include "efl-answers/DisplayLanguage.h"

#include <libintl.h>
#include <unicode/unistr.h>

#include <array>
#include <filesystem>
#include <fstream>
#include <optional>
#include <string_view>

namespace {

namespace fs = std::filesystem;

/// What is no UTF-8 shows as the sign for that; a bus carries nothing else.
std::string utf8(const std::string& text) {
    std::string valid;
    // Up to a zero byte, as a device's services hand texts on.
    icu::UnicodeString::fromUTF8(text.c_str()).toUTF8String(valid);
    return valid;
}

/// The package's own text, under the domain that a device's framework binds for an application.
std::string translated(const std::string& appId, const fs::path& root, const std::string& id) {
    const std::string domain = appId.substr(appId.rfind('.') + 1);
    DisplayLanguage::bindTexts(domain, (root / "res/locale").string());
    return dgettext(domain.c_str(), id.c_str());
}

std::string shown(device::Device& device, const std::string& appId, const device::NotificationText& text) {
    // The text of the empty id is the catalogue's header.
    const std::optional<fs::path> root = text.id.empty() ? std::nullopt : device.packages().rootOf(appId);
    const std::string found = root ? translated(appId, *root, text.id) : text.id;
    return utf8(found == text.id ? text.plain : found);
}

/// By how the file begins: one that is damaged or of another kind would leave an empty place.
bool isPicture(const fs::path& file) {
    constexpr std::array<std::string_view, 5> beginnings = {"\x89PNG", "\xFF\xD8\xFF", "GIF8", "RIFF", "<"};
    std::error_code ignored;
    if (!fs::is_regular_file(file, ignored))
        return false;
    std::array<char, 4> bytes{};
    std::ifstream(file, std::ios::binary).read(bytes.data(), bytes.size());
    const std::string_view begin(bytes.data(), bytes.size());
    for (const std::string_view beginning : beginnings)
        if (begin.starts_with(beginning))
            return true;
    return false;
}

/// None where it is not installed, and where its manifest is broken: the notification still says what it says.
std::optional<device::Package> posterOf(device::Device& device, const device::Notification& notification) {
    try {
        return device.packages().find(notification.appId);
    } catch (const device::Error&) {
        return std::nullopt;
    }
}

/// A device's path is looked for below the device's folder first. The application's own icon comes before the one for
/// the indicator, which is white as the indicator's signs are and would not be seen on a bright notification.
std::string iconOf(const device::Folder& folder, const device::Notification& notification,
                   const std::string& ofApplication) {
    const auto onDevice = [&](const std::string& path) { return folder.root() / fs::path(path).relative_path(); };
    for (const fs::path& icon : {onDevice(notification.icon), fs::path(notification.icon), fs::path(ofApplication),
                                 onDevice(notification.indicatorIcon), fs::path(notification.indicatorIcon)})
        if (icon.is_absolute() && isPicture(icon))
            return icon.string();
    return "";
}

}  // namespace

NotificationAppearance NotificationAppearance::of(device::Device& device, const device::Notification& notification) {
    const std::string language = device.language();
    DisplayLanguage(language).use();
    const std::optional<device::Package> poster = posterOf(device, notification);
    return {utf8(poster ? poster->labelIn(language) : notification.appId),
            shown(device, notification.appId, notification.title),
            shown(device, notification.appId, notification.content),
            iconOf(device.folder(), notification, poster ? poster->icon : "")};
}
