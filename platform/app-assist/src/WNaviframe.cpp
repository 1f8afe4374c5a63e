#include "app-assist/WNaviframe.h"

#include "BackKeys.h"
#include "Guarded.h"
#include "app-assist/WView.h"
#include "efl-answers/RefusedPop.h"

#include <algorithm>
#include <utility>

namespace app_assist {

namespace {

/// Under this name the Evas object knows its WNaviframe.
constexpr char selfKey[] = "app_assist::WNaviframe";

/// The item that is about to be popped as soon as it has moved in; null when there is none.
Elm_Object_Item* goingItem(const Evas_Object* naviframe) {
    return static_cast<Elm_Object_Item*>(evas_object_data_get(naviframe, efl_answers::refusedPopKey));
}

/// Null for the lowest.
Elm_Object_Item* itemBeneath(const Evas_Object* naviframe, const Elm_Object_Item* item) {
    Eina_List* items = elm_naviframe_items_get(naviframe);
    const Eina_List* node = eina_list_data_find_list(items, item);
    const Eina_List* beneath = node ? eina_list_prev(node) : nullptr;
    auto* found = static_cast<Elm_Object_Item*>(beneath ? eina_list_data_get(beneath) : nullptr);
    eina_list_free(items);
    return found;
}

}  // namespace

WNaviframe::WNaviframe() = default;

WNaviframe::~WNaviframe() {
    WNaviframe::destroy();
    if (deletionJob_)
        ecore_job_del(deletionJob_);
    for (WView* view : views_)
        view->naviframe_ = nullptr;
}

bool WNaviframe::create(Evas_Object* parent, void*) {
    naviframe_ = elm_naviframe_add(parent);
    if (!naviframe_)
        return false;
    evas_object_data_set(naviframe_, selfKey, this);
    evas_object_event_callback_add(naviframe_, EVAS_CALLBACK_DEL, evasObjectGoes, this);
    evas_object_smart_callback_add(
        naviframe_, "item,activated",
        [](void* self, Evas_Object*, void*) { static_cast<WNaviframe*>(self)->announceTop(); }, this);
    backKeys_ = std::make_unique<BackKeys>(evas_object_evas_get(naviframe_), [this] { back(); });
    return true;
}

void WNaviframe::destroy() {
    if (naviframe_)
        evas_object_del(naviframe_);
}

// Its items, and with them the views, go after this.
void WNaviframe::evasObjectGoes(void* data, Evas*, Evas_Object* object, void*) {
    auto* self = static_cast<WNaviframe*>(data);
    evas_object_data_del(object, selfKey);
    self->backKeys_.reset();
    self->naviframe_ = nullptr;
    for (WView* view : self->views_)
        view->naviItem_ = nullptr;
}

void WNaviframe::push(WView* view, const char* title, void* viewParam) {
    if (!view)
        return;
    view->window_ = window_;
    view->naviframe_ = this;
    views_.push_back(view);
    const std::weak_ptr<void> life = view->life();
    if (putOnStack(*view, title, viewParam) || life.expired())
        return;
    dlog_print(DLOG_ERROR, logTag, "the view %s could not be pushed", view->getClassName());
    // Deleting the Evas object first has the view told by onDestroy().
    view->giveAway();
    view->destroy();
    if (!life.expired())
        delete view;
}

/// False when the view is not on the stack, for whatever reason; it may have been deleted then.
bool WNaviframe::putOnStack(WView& view, const char* title, void* viewParam) {
    if (!naviframe_)
        return false;
    const std::weak_ptr<void> life = view.life();
    if (!view.create(naviframe_, viewParam))
        return false;
    view.onSetContainerProperties(naviframe_);
    Elm_Object_Item* going = goingItem(naviframe_);
    Elm_Object_Item* item = view.onPushToNaviframe(naviframe_);
    if (life.expired() || !item)
        return false;
    adopt(view, item);
    if (going && elm_naviframe_top_item_get(naviframe_) != going)
        takeAway(going);
    if (title)
        elm_object_item_text_set(item, title);
    view.onPushed(item);
    if (!life.expired())
        announceTop();
    return true;
}

void WNaviframe::adopt(WView& view, Elm_Object_Item* item) {
    view.naviItem_ = item;
    view.giveAway();
    elm_naviframe_item_pop_cb_set(item, itemPops, this);
    elm_object_item_del_cb_set(item, itemGone);
}

Eina_Bool WNaviframe::itemPops(void* data, Elm_Object_Item* item) {
    auto* self = static_cast<WNaviframe*>(data);
    bool pops = false;
    guarded("a view's onPop", [&] {
        WView* view = self->viewOf(item);
        pops = !view || view->onPop();
    });
    if (pops && self->naviframe_ && elm_naviframe_bottom_item_get(self->naviframe_) == item) {
        elm_exit();
        return EINA_FALSE;
    }
    return pops;
}

void WNaviframe::itemGone(void*, Evas_Object* naviframe, void* item) {
    auto* self = static_cast<WNaviframe*>(evas_object_data_get(naviframe, selfKey));
    if (!self)
        return;
    std::erase(self->itemsToDelete_, item);
    if (WView* view = self->viewOf(static_cast<Elm_Object_Item*>(item)))
        view->naviItem_ = nullptr;
}

void WNaviframe::viewGone(const WView& view) {
    std::erase(views_, &view);
    if (announced_ == &view)
        announced_ = nullptr;
    // The item is either about to go with its view, or it stays behind without content and must go too.
    if (naviframe_ && view.naviItem_)
        deleteSoon(view.naviItem_);
}

/// One that was to be popped and is covered now: its pop would come to nothing.
void WNaviframe::takeAway(Elm_Object_Item* item) {
    evas_object_data_del(naviframe_, efl_answers::refusedPopKey);
    if (itemPops(this, item))
        deleteSoon(item);
}

void WNaviframe::deleteSoon(Elm_Object_Item* item) {
    itemsToDelete_.push_back(item);
    if (!deletionJob_)
        deletionJob_ = ecore_job_add([](void* self) { static_cast<WNaviframe*>(self)->deleteItems(); }, this);
}

void WNaviframe::deleteItems() {
    deletionJob_ = nullptr;
    while (naviframe_ && !itemsToDelete_.empty()) {
        Elm_Object_Item* item = itemsToDelete_.back();
        itemsToDelete_.pop_back();
        elm_object_item_del(item);
    }
    announceTop();
}

void WNaviframe::announceTop() {
    WView* top = getTopView();
    if (!top || top == announced_)
        return;
    announced_ = top;
    guarded("a view's onBecomeTop", [top] { top->onBecomeTop(); });
}

void WNaviframe::back() {
    if (!naviframe_)
        return;
    if (elm_naviframe_top_item_get(naviframe_))
        elm_naviframe_item_pop(naviframe_);
    else
        elm_exit();
}

WView* WNaviframe::viewOf(const Elm_Object_Item* item) const {
    const auto found =
        std::find_if(views_.begin(), views_.end(), [item](const WView* v) { return v->naviItem_ == item; });
    return found == views_.end() ? nullptr : *found;
}

WView* WNaviframe::getTopView() const {
    const Elm_Object_Item* item = naviframe_ ? elm_naviframe_top_item_get(naviframe_) : nullptr;
    if (item && item == goingItem(naviframe_))
        if (const Elm_Object_Item* beneath = itemBeneath(naviframe_, item))
            item = beneath;
    return item ? viewOf(item) : nullptr;
}

}  // namespace app_assist
