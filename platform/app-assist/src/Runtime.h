#pragma once

#include "BusPresence.h"
#include "DisplayWindow.h"
#include "LaunchRequest.h"
#include "Toolkit.h"

#include <app-assist/WApp.h>
#include <device/ApplicationLock.h>
#include <device/Device.h>

#include <optional>

namespace app_assist {

/// One run of an application, in steps: what stands between a process and the application object in it.
class Runtime {
public:
    explicit Runtime(WApp& app, Toolkit::Messages messages = Toolkit::Messages::InLog)
        : app_(app), messages_(messages) {}
    /// Ends what was begun.
    ~Runtime();
    Runtime(const Runtime&) = delete;
    Runtime& operator=(const Runtime&) = delete;

    /// Everything up to the main loop, which then delivers the first launch request, or waits for it on the bus.
    /// nullopt when the main loop may run, else the process's exit status; why is said on standard error.
    std::optional<int> begin(int argc, char** argv);
    void end();

private:
    void startToolkit(int argc, char** argv);
    bool createApplication(int argc, char** argv);
    std::optional<int> joinBus();
    /// Opens the device as the one process that is the application. An exit status where another process is, which
    /// then has this one's launch request.
    std::optional<int> claimInstance();
    /// The exit status of a second process; nullopt when the first has ended meanwhile.
    std::optional<int> handOver();
    void queueFirstRequest();
    /// The application ends when the request does not come that it was started for.
    void awaitRequest();
    void deliver(const LaunchRequest::Extras& extras);
    void raiseWindow() const;
    /// The application's; null when there is none.
    Evas_Object* window() const;
    void followDevice();
    void settingChanged(const std::string& key);
    /// What changed before the device could tell of it.
    void catchUp();
    void useLanguage();
    void useTheme();

    WApp& app_;
    Toolkit::Messages messages_;
    device::Device* device_ = nullptr;
    std::optional<Toolkit> toolkit_;
    std::optional<PreinitializedWindow> windowAhead_;
    std::optional<BusPresence> presence_;
    std::optional<device::ApplicationLock> instance_;
    device::Events::Subscription settings_;
    /// The language and the theme that are in use.
    std::string language_;
    bool isDark_ = false;
    LaunchRequest::Words words_;
    Ecore_Idle_Enterer* firstRequest_ = nullptr;
    Ecore_Timer* patience_ = nullptr;
    bool created_ = false;
    bool firstLaunch_ = true;
};

}  // namespace app_assist
