#pragma once

#include "app-assist/WUIObject.h"

namespace app_assist {

class WView;

/// A stack of views of which the top one shows. Owns the views that were pushed.
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

    /// Null when the stack is empty.
    WView* getTopView() const;
    bool isTopView(const WView* view) const { return view && getTopView() == view; }

private:
    Evas_Object* naviframe_ = nullptr;
};

}  // namespace app_assist
