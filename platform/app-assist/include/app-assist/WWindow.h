#pragma once

#include <Elementary.h>

#include <functional>
#include <memory>
#include <string>

namespace app_assist {

class WUIObject;

/// The application's window, which is the device's display: as large as that, and never of another size. Owns its
/// Evas object and its base UI object. Its end, by whatever way, ends the main loop.
class WWindow {
public:
    WWindow(const char* name, Elm_Win_Type type);
    ~WWindow();
    WWindow(const WWindow&) = delete;
    WWindow& operator=(const WWindow&) = delete;

    /// Gives the window's Evas object in place of a plain elm_win_add(); may return null.
    void setOnCreateWin(std::function<Evas_Object*()> onCreateWin);

    const char* getName() const { return name_.c_str(); }
    Elm_Win_Type getWinType() const { return type_; }
    /// Null before it is attached to the application, after it was closed, or when it could not be made.
    Evas_Object* getEvasObj() const { return window_; }

    /// Takes `object` over, creates it in the window and shows it over the whole of it. Without an Evas window
    /// the object is kept and never created.
    void attachBaseUiObject(WUIObject* object, void* viewParam);
    WUIObject* getBaseUiObject() const { return base_.get(); }

private:
    friend class WApp;
    void create();
    void fitBase();
    static void evasObjectGoes(void* window, Evas*, Evas_Object*, void*);
    static void resized(void* window, Evas*, Evas_Object*, void*);

    std::string name_;
    Elm_Win_Type type_;
    std::function<Evas_Object*()> onCreateWin_;
    Evas_Object* window_ = nullptr;
    std::unique_ptr<WUIObject> base_;
};

}  // namespace app_assist
