#pragma once

#include "app-assist/WUIObject.h"

#include <Elementary.h>

#include <memory>
#include <string>
#include <vector>

namespace app_assist {

class BackKeys;
class WView;

/// A stack of views of which the top one shows. Owns the views that were pushed.
/// The device's back key pops the top view, wherever the focus is; on the last, or without one, it ends the program.
class WNaviframe : public WUIObject {
public:
    WNaviframe();
    ~WNaviframe() override;

    bool create(Evas_Object* parent, void* viewParam) override;
    void destroy() override;
    Evas_Object* getEvasObj() const override { return naviframe_; }

    /// Takes `view` over: creates it with `viewParam`, has it put itself on the stack (onPushToNaviframe) and
    /// tells it (onPushed). A non-null `title` becomes the item's title. A view that cannot be created or put on
    /// the stack is freed, with an error line in the log.
    void push(WView* view, const char* title, void* viewParam);

    /// The view that shows, or that will when the one above it, which was popped while it was still moving in, is gone.
    /// Null when the stack is empty.
    WView* getTopView() const;
    bool isTopView(const WView* view) const { return view && getTopView() == view; }

    /// What the back key does.
    void back();

private:
    friend class WView;

    bool putOnStack(WView& view, const char* title, void* viewParam);
    void adopt(WView& view, Elm_Object_Item* item);
    void viewGone(const WView& view);
    void takeAway(Elm_Object_Item* item);
    void deleteSoon(Elm_Object_Item* item);
    void announceTop();
    void deleteItems();
    WView* viewOf(const Elm_Object_Item* item) const;

    static Eina_Bool itemPops(void* naviframe, Elm_Object_Item* item);
    static void itemGone(void*, Evas_Object* naviframe, void* item);
    static void evasObjectGoes(void* naviframe, Evas*, Evas_Object*, void*);

    Evas_Object* naviframe_ = nullptr;
    std::unique_ptr<BackKeys> backKeys_;
    std::vector<WView*> views_;
    /// Items on the stack that are to go: their views are gone, or they were popped and are covered.
    std::vector<Elm_Object_Item*> itemsToDelete_;
    Ecore_Job* deletionJob_ = nullptr;
    const WView* announced_ = nullptr;
};

}  // namespace app_assist
