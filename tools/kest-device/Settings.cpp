#include "Settings.h"

#include "device/Error.h"
#include "device/Keys.h"

#include <algorithm>
#include <array>
#include <cctype>
#include <vector>

namespace tool {

namespace {

struct Name {
    const char* name;
    const char* key;
};

constexpr std::array names{Name{"language", device::keys::language}, Name{"country", device::keys::country},
                           Name{"theme", device::keys::theme}, Name{"screen", device::keys::screen}};
/// Of the settings that a fresh device has.
const std::map<std::string, std::string> freshValues = {{"language", device::keys::defaultLanguage},
                                                        {"theme", device::keys::defaultTheme},
                                                        {"screen", device::keys::defaultScreen}};
constexpr char codeset[] = ".UTF-8";
constexpr char noCountry[] = "none";

std::string keyOf(const std::string& name) {
    for (const Name& known : names) {
        if (name == known.name) {
            return known.key;
        }
    }
    if (name.find('/') == std::string::npos || name.front() == '/' || name.back() == '/') {
        throw device::Error("there is no setting \"" + name +
                            "\"; there are language, country, theme, screen, and vconf keys such as db/setting/theme");
    }
    return name;
}

std::string withoutCodeset(const std::string& language) {
    return language.substr(0, language.find('.'));
}

std::string joined(const std::vector<std::string>& words) {
    std::string text;
    for (const std::string& word : words) {
        text += (text.empty() ? "" : ", ") + word;
    }
    return text;
}

void requireOneOf(const std::string& what, const std::string& value, const std::vector<std::string>& known) {
    if (std::find(known.begin(), known.end(), value) == known.end()) {
        throw device::Error("there is no " + what + " \"" + value + "\"; there are " + joined(known));
    }
}

std::vector<std::string> screenNames() {
    std::vector<std::string> screens;
    for (const device::Screen& screen : device::Screen::all()) {
        screens.push_back(screen.name);
    }
    return screens;
}

void storeCountry(device::Device& device, const std::string& value) {
    const bool twoCapitals = value.size() == 2 && std::isupper(static_cast<unsigned char>(value[0])) &&
                             std::isupper(static_cast<unsigned char>(value[1]));
    if (!twoCapitals && value != noCountry) {
        throw device::Error("a country is two capital letters such as IN, or none; \"" + value + "\" is neither");
    }
    device.preferences().clearAll();
    if (value == noCountry) {
        device.settings().remove(device::keys::country);
    } else {
        device.settings().set(device::keys::country, value);
    }
}

/// The name that people use for a key that has one.
std::string nameOf(const std::string& key) {
    const auto known = std::find_if(names.begin(), names.end(), [&](const Name& name) { return name.key == key; });
    return known == names.end() ? key : known->name;
}

/// As people write it: the language without its codeset.
std::string forPeople(const std::string& key, const std::string& value) {
    return key == device::keys::language ? withoutCodeset(value) : value;
}

}  // namespace

std::optional<std::string> readSetting(device::Device& device, const std::string& name) {
    const std::string key = keyOf(name);
    const std::optional<std::string> value = device.settings().get(key);
    return value && key != name ? forPeople(key, *value) : value;
}

std::map<std::string, std::string> readSettings(device::Device& device) {
    std::map<std::string, std::string> settings;
    for (const auto& setting : device.settings().all()) {
        settings[nameOf(setting.first)] = forPeople(setting.first, setting.second);
    }
    return settings;
}

void storeSetting(device::Device& device, const std::string& nameOrKey, const std::string& value) {
    const std::string name = nameOf(nameOrKey);
    if (name == "language") {
        const std::string language = withoutCodeset(value);
        requireOneOf("language", language, device.languages());
        device.settings().set(device::keys::language, language + codeset);
    } else if (name == "country") {
        storeCountry(device, value);
    } else if (name == "theme") {
        requireOneOf("theme", value, {"light", "dark"});
        device.settings().set(device::keys::theme, value);
    } else if (name == "screen") {
        requireOneOf("screen", value, screenNames());
        device.settings().set(device::keys::screen, value);
    } else {
        device.settings().set(keyOf(name), value);
    }
}

void removeSetting(device::Device& device, const std::string& nameOrKey) {
    const std::string name = nameOf(nameOrKey);
    if (name == "country") {
        storeCountry(device, noCountry);
    } else if (const auto fresh = freshValues.find(name); fresh != freshValues.end()) {
        device.settings().set(keyOf(name), fresh->second);
    } else {
        device.settings().remove(keyOf(name));
    }
}

}  // namespace tool
