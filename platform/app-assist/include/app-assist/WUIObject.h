#pragma once

#include <Evas.h>

namespace app_assist {

class WWindow;

/// Something that has an Evas object on the screen.
class WUIObject {
public:
    /// Makes the Evas object below `parent`; false when that failed. Called by the framework.
    virtual bool create(Evas_Object* parent, void* viewParam) = 0;
    /// Deletes the Evas object.
    virtual void destroy() = 0;
    /// Null before create() and after destroy().
    virtual Evas_Object* getEvasObj() const = 0;
    virtual ~WUIObject() = default;

    /// The window that it was attached to, directly or through its naviframe; null outside one.
    WWindow* getWindow() const { return window_; }

private:
    friend class WWindow;
    friend class WNaviframe;
    friend class WPageSlideView;
    WWindow* window_ = nullptr;
};

}  // namespace app_assist
