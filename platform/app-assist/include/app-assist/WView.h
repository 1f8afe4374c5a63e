#pragma once

#include "app-assist/WUIObject.h"

#include <Elementary.h>

namespace app_assist {

class WNaviframe;

/// One screen. A subclass makes its Evas object and says how it enters a naviframe. The naviframe (or the page
/// slide view) that it was given to owns it: it is destroyed when its Evas object goes.
class WView : public WUIObject {
public:
    WView();

    bool create(Evas_Object* parent, void* viewParam) override;
    void destroy() override;
    Evas_Object* getEvasObj() const override { return evasObject_; }

    ~WView() override;

    /// The class's name, for people who look at the screen's tree.
    virtual const char* getClassName() const;

protected:
    /// Makes the view's Evas object; null when it cannot.
    virtual Evas_Object* onCreate(Evas_Object* parent, void* viewParam) = 0;
    /// The Evas object stands.
    virtual void onCreated();
    /// The Evas object is about to go.
    virtual void onDestroy();
    /// A chance to set properties of the container (window or naviframe) that will hold the view.
    virtual void onSetContainerProperties(Evas_Object* container);
    /// Puts the view on the naviframe and returns the item; the base pushes it plainly.
    virtual Elm_Object_Item* onPushToNaviframe(Evas_Object* naviframe);
    virtual void onPushed(Elm_Object_Item* naviItem);
    /// Called before the view is popped by its user; false keeps it.
    virtual bool onPop();
    virtual void onBecomeTop();
    /// The view has become a page of a page slide view instead of an item.
    virtual void onSetAsPageContent();

public:
    /// The naviframe and the item that hold the view; null when none does.
    WNaviframe* getNaviframe() const { return naviframe_; }
    Elm_Object_Item* getNaviItem() const { return naviItem_; }

private:
    friend class WNaviframe;
    friend class WPageSlideView;

    Evas_Object* evasObject_ = nullptr;
    WNaviframe* naviframe_ = nullptr;
    Elm_Object_Item* naviItem_ = nullptr;
};

}  // namespace app_assist
