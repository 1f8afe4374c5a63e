#pragma once

#include <app_control.h>

#include <memory>

namespace app_assist {

class WWindow;

/// The application object of the framework: one a process. A subclass answers its life cycle.
class WApp {
public:
    WApp();
    virtual ~WApp();
    WApp(const WApp&) = delete;
    WApp& operator=(const WApp&) = delete;

    /// Makes the process an application of the device (its language, text domain, display, theme and bus), runs
    /// onStart, onCreate, the first onAppControl from inside the main loop, and the main loop until it ends,
    /// then onTerminate. `argv` holds KEY=VALUE words, the extras of the first launch request; or one word alone: a
    /// link of the application, or "--dbus-activated", with which the bus starts it for a request that it then brings.
    /// Returns the process's exit status: 0; 1 when the device cannot be opened, when there is no display, when the
    /// bus has another device or is missing for "--dbus-activated", or when onCreate returned false; 2 for words that
    /// are no launch request: of another form, an extra given twice, not UTF-8 or more than 64 KiB. Each is said on
    /// standard error.
    /// Where another process of the same device is the application, that one gets the launch request, which is said and
    /// gives 0; 1 when it cannot be handed over.
    int start(int argc, char** argv);

    /// Takes the window over and creates it. The window ends the application when it is closed.
    void attachWindow(WWindow* window);
    /// The window as it was attached; null before that. It stays when its Evas object could not be made or is gone.
    WWindow* getWindow() const;

    /// The process's application object; null outside its life.
    static WApp* getInstance();

protected:
    /// The device is open and EFL runs; no window is attached yet.
    virtual void onStart(int argc, char** argv);
    /// Makes the window and what there is before the first launch request; false ends the application with status 1.
    virtual bool onCreate();
    /// The main loop has ended. Called only where onCreate() returned true.
    virtual void onTerminate();
    /// The window is out of sight (put away), or in sight again. Also around the main loop: in sight after the
    /// first launch request, out of sight before onTerminate.
    virtual void onPause();
    virtual void onResume();
    /// A launch request, of which the first started the application; after a later one, and after one for which the bus
    /// started it, its window is raised.
    /// `request` is freed by the framework afterwards.
    virtual void onAppControl(app_control_h request, bool firstLaunch);

private:
    friend class Runtime;
    void setInSight(bool inSight);
    /// What the window tells counts from the first launch request until the application ends.
    void beginSight();
    void endSight();

    std::unique_ptr<WWindow> window_;
    bool inSight_ = false;
    bool watchesWindow_ = false;
};

}  // namespace app_assist
