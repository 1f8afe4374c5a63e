#include "device/Device.h"

#include "device/Error.h"
#include "device/Faults.h"
#include "device/Keys.h"

#include <algorithm>
#include <cstdio>
#include <cstdlib>
#include <utility>

namespace device {
namespace {

std::unique_ptr<Device>& slot() {
    static std::unique_ptr<Device> device;
    return device;
}

std::unique_ptr<Device> openOrReplace(const Device::Options& options) {
    try {
        return std::make_unique<Device>(options);
    } catch (const DamagedError& damage) {
        std::fprintf(stderr, "%s\n", damage.what());
    }
    return std::make_unique<Device>(options);
}

std::unique_ptr<Device> openStandard() {
    if (const char* faults = std::getenv("DEVICE_FAULTS"))
        faults::planFromText(faults);
    return openOrReplace(Device::Options::standard());
}

Device::Options withFolder(Device::Options options) {
    options.folder.create();
    return options;
}

}  // namespace

Device::Options Device::Options::standard() {
    return {Folder::resolve(), {DEVICE_PREINSTALLED_DIR}, DEVICE_DATA_DIR, Database::Check::Quick, DEVICE_NOTIFIER};
}

Device::Device(Options options)
    : options_(withFolder(std::move(options))), database_(options_.folder, options_.check),
      settings_(database_, events_), preferences_(database_),
      packages_(database_, events_, options_.folder, options_.preinstalled), usage_(database_), launches_(database_),
      notifications_(database_), log_(options_.folder.log()), presenter_(options_.folder, log_, options_.notifier),
      launcher_(*this) {}

Device::~Device() = default;

Device& Device::current() {
    if (!slot())
        slot() = openStandard();
    return *slot();
}

Device& Device::reopenCurrent() {
    const Options options = current().options_;
    std::unique_ptr<Application> application = std::move(current().application_);
    slot().reset();
    slot() = openOrReplace(options);
    slot()->application_ = std::move(application);
    return *slot();
}

void Device::setCurrent(std::unique_ptr<Device> device) {
    slot() = std::move(device);
}

const Screen& Device::screen() const {
    if (!screen_)
        screen_ = &Screen::named(settings_.get(keys::screen).value_or(keys::defaultScreen));
    return *screen_;
}

std::string Device::language() const {
    std::string language = settings_.get(keys::language).value_or(keys::defaultLanguage);
    const auto codeset = std::min(language.find('.'), language.size());
    return language.erase(codeset, std::min(language.find('@', codeset), language.size()) - codeset);
}

bool Device::isDark() const {
    return settings_.get(keys::theme).value_or(keys::defaultTheme) == "dark";
}

std::vector<std::string> Device::languages() const {
    std::vector<std::string> languages;
    std::error_code error;
    for (const auto& entry : std::filesystem::directory_iterator(data() / "locale", error))
        if (std::filesystem::is_regular_file(entry.path() / "LC_MESSAGES/sys_string.mo", error))
            languages.push_back(entry.path().filename().string());
    std::sort(languages.begin(), languages.end());
    return languages;
}

const Application& Device::application() {
    if (!application_)
        application_ = std::make_unique<Application>(Application::ofThisProcess());
    return *application_;
}

void Device::setApplication(Application application) {
    application_ = std::make_unique<Application>(std::move(application));
}

}  // namespace device
