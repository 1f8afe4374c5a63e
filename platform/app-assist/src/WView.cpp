#include "app-assist/WView.h"

#include "Guarded.h"
#include "UiTimers.h"
#include "app-assist/WNaviframe.h"
#include "app-assist/WPageSlideView.h"

#include <cxxabi.h>

#include <cstdlib>
#include <typeinfo>

namespace app_assist {

WView::WView() : life_(std::make_shared<char>()) {}

WView::~WView() {
    UiTimers::endOf(this);
    if (naviframe_)
        naviframe_->viewGone(*this);
    if (book_)
        book_->pageGone(*this);
    if (!evasObject_)
        return;
    Evas_Object* object = evasObject_;
    forgetEvasObject();
    evas_object_del(object);
}

bool WView::create(Evas_Object* parent, void* viewParam) {
    evasObject_ = onCreate(parent, viewParam);
    if (!evasObject_)
        return false;
    // Whoever looks at the screen from outside finds the view by this name.
    evas_object_name_set(evasObject_, getClassName());
    evas_object_event_callback_add(evasObject_, EVAS_CALLBACK_DEL, evasObjectGoes, this);
    evas_object_event_callback_add(evasObject_, EVAS_CALLBACK_FREE, evasObjectGone, this);
    onCreated();
    return true;
}

void WView::destroy() {
    if (evasObject_)
        evas_object_del(evasObject_);
}

void WView::evasObjectGoes(void* data, Evas*, Evas_Object*, void*) {
    auto* view = static_cast<WView*>(data);
    guarded("a view's onDestroy", [view] { view->onDestroy(); });
    UiTimers::endOf(view);
}

// The view outlives what lies inside its Evas object, which may call it back to the last.
void WView::evasObjectGone(void* data, Evas*, Evas_Object*, void*) {
    auto* view = static_cast<WView*>(data);
    view->evasObject_ = nullptr;
    if (view->ownsItself_)
        delete view;
}

void WView::forgetEvasObject() {
    evas_object_event_callback_del_full(evasObject_, EVAS_CALLBACK_DEL, evasObjectGoes, this);
    evas_object_event_callback_del_full(evasObject_, EVAS_CALLBACK_FREE, evasObjectGone, this);
    evasObject_ = nullptr;
}

WNaviframe* WView::getNaviframe() const {
    return book_ ? book_->getNaviframe() : naviframe_;
}

Elm_Object_Item* WView::getNaviItem() const {
    return book_ ? book_->getNaviItem() : naviItem_;
}

const char* WView::getClassName() const {
    if (className_.empty()) {
        const char* mangled = typeid(*this).name();
        const std::unique_ptr<char, decltype(&std::free)> name(abi::__cxa_demangle(mangled, nullptr, nullptr, nullptr),
                                                               std::free);
        className_ = name ? name.get() : mangled;
    }
    return className_.c_str();
}

void WView::onCreated() {}

void WView::onDestroy() {}

void WView::onSetContainerProperties(Evas_Object*) {}

Elm_Object_Item* WView::onPushToNaviframe(Evas_Object* naviframe) {
    return elm_naviframe_item_push(naviframe, nullptr, nullptr, nullptr, evasObject_, nullptr);
}

void WView::onPushed(Elm_Object_Item*) {}

bool WView::onPop() {
    return true;
}

void WView::onBecomeTop() {}

void WView::onSetAsPageContent() {}

}  // namespace app_assist
