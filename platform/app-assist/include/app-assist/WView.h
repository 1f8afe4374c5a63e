#pragma once

#include "app-assist/WUIObject.h"

#include <Elementary.h>

#include <memory>
#include <string>

namespace app_assist {

class WNaviframe;
class WPageSlideView;

/// One screen. A subclass makes its Evas object and says how it enters a naviframe. The naviframe (or the page
/// slide view) that it was given to owns it: when the Evas object goes, for whatever reason, onDestroy() is called
/// once, and the view is deleted when everything inside its Evas object is gone too.
class WView : public WUIObject {
public:
    WView();

    bool create(Evas_Object* parent, void* viewParam) override;
    void destroy() override;
    Evas_Object* getEvasObj() const override { return evasObject_; }

    ~WView() override;

    /// The name of the view's class, under which it stands in the screen's tree. The base finds it out by itself.
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
    /// Puts the view on the naviframe and returns the item; null when that failed. The base pushes it plainly.
    virtual Elm_Object_Item* onPushToNaviframe(Evas_Object* naviframe);
    /// The view is on the naviframe, or a page of a page slide view; then `naviItem` is the item that holds that one.
    virtual void onPushed(Elm_Object_Item* naviItem);
    /// Called before the view is popped; false keeps it. The last view is never popped: the application ends.
    virtual bool onPop();
    /// The view has become the naviframe's top view: it was pushed, or what lay above it is gone.
    virtual void onBecomeTop();
    /// The view has become a page of a page slide view instead of an item; onPushed() follows.
    virtual void onSetAsPageContent();

public:
    /// The naviframe and the item that hold the view, or the view that it is a page of; null when none does.
    WNaviframe* getNaviframe() const;
    Elm_Object_Item* getNaviItem() const;

private:
    friend class WNaviframe;
    friend class WPageSlideView;

    static void evasObjectGoes(void* view, Evas*, Evas_Object*, void*);
    static void evasObjectGone(void* view, Evas*, Evas_Object*, void*);
    void forgetEvasObject();
    /// From now on the view is deleted with its Evas object.
    void giveAway() { ownsItself_ = true; }
    /// Tells afterwards, when it has expired, that the view was deleted meanwhile.
    std::weak_ptr<void> life() const { return life_; }

    std::shared_ptr<void> life_;
    mutable std::string className_;
    bool ownsItself_ = false;
    Evas_Object* evasObject_ = nullptr;
    /// The page slide view that it is a page of.
    WPageSlideView* book_ = nullptr;
    WNaviframe* naviframe_ = nullptr;
    Elm_Object_Item* naviItem_ = nullptr;
};

}  // namespace app_assist
