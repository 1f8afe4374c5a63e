#pragma once

#include "device/Application.h"
#include "device/Database.h"
#include "device/Events.h"
#include "device/Folder.h"
#include "device/Launcher.h"
#include "device/Launches.h"
#include "device/Log.h"
#include "device/Notifications.h"
#include "device/Packages.h"
#include "device/Preferences.h"
#include "device/Presenter.h"
#include "device/Screen.h"
#include "device/Settings.h"
#include "device/Usage.h"

#include <filesystem>
#include <memory>
#include <string>
#include <vector>

namespace device {

/// One device: its folder, its database and the services on them. The one place that holds device state.
class Device {
public:
    struct Options {
        Folder folder;
        /// Folders of packages that every device has; the first one that holds an id wins.
        std::vector<std::filesystem::path> preinstalled;
        /// The platform's own data: locale/ and the theme.
        std::filesystem::path data;
        Database::Check check = Database::Check::Quick;
        /// Shows a notification on the desktop, for the Presenter.
        std::filesystem::path notifier = {};

        /// What the environment and the build say.
        static Options standard();
    };

    /// Makes the folder and a fresh database where there is none.
    /// Throws Error when that fails, DamagedError when a damaged database was set aside, and DamagedInUseError when it
    /// was not, because an application runs on the device.
    explicit Device(Options options);
    ~Device();

    /// The process's device, opened at the first call with Options::standard(). A damaged database is set aside,
    /// said on standard error, and replaced. Throws Error when the device cannot be opened.
    static Device& current();
    /// Opens it anew, in the same folder and for the same application. Throws as current() does.
    static Device& reopenCurrent();
    /// Puts another device in its place (nullptr: none, the next current() opens one anew). For tests and tools.
    static void setCurrent(std::unique_ptr<Device> device);

    const Folder& folder() const { return options_.folder; }
    const std::filesystem::path& data() const { return options_.data; }
    Database& database() { return database_; }
    Events& events() { return events_; }
    Settings& settings() { return settings_; }
    Preferences& preferences() { return preferences_; }
    Packages& packages() { return packages_; }
    Usage& usage() { return usage_; }
    Launches& launches() { return launches_; }
    Notifications& notifications() { return notifications_; }
    Presenter& presenter() { return presenter_; }
    Launcher& launcher() { return launcher_; }
    Log& log() { return log_; }

    /// The display, by the setting keys::screen as it was when this was first asked for: a window cannot change its
    /// display, so a change of the setting counts from the next start on.
    const Screen& screen() const;
    /// The display language without its codeset ("ko_KR").
    std::string language() const;
    /// Whether the device's theme is the dark one; else it is the light one.
    bool isDark() const;
    /// The languages that the device's own texts exist in, in alphabetical order ("en_US", ...).
    std::vector<std::string> languages() const;

    /// The application of this process. Application::ofThisProcess() unless setApplication() said otherwise.
    const Application& application();
    void setApplication(Application application);

private:
    Options options_;
    Database database_;
    Events events_;
    Settings settings_;
    Preferences preferences_;
    Packages packages_;
    Usage usage_;
    Launches launches_;
    Notifications notifications_;
    Log log_;
    Presenter presenter_;
    Launcher launcher_;
    std::unique_ptr<Application> application_;
    mutable const Screen* screen_ = nullptr;
};

}  // namespace device
