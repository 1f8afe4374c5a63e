#pragma once

#include <app-assist/WView.h>

#include <functional>
#include <string>
#include <vector>

/// What happened to views, in order, each as "<view>: <what>".
using Story = std::vector<std::string>;

/// A view that tells what happens to it. It shows a button that can take the focus.
class TellingView : public app_assist::WView {
public:
    TellingView(std::string name, Story& story) : name_(std::move(name)), story_(story) {}
    ~TellingView() override { tell("deleted"); }

    const char* getClassName() const override { return name_.c_str(); }

    bool canBeCreated = true;
    bool canBePushed = true;
    bool lowest = false;  ///< goes in beneath what is on the top
    bool pops = true;
    std::function<void()> inCreated, inPushed, inDestroy;

protected:
    Evas_Object* onCreate(Evas_Object* parent, void*) override {
        tell("onCreate");
        if (!canBeCreated)
            return nullptr;
        Evas_Object* button = elm_button_add(parent);
        elm_object_text_set(button, name_.c_str());
        return button;
    }
    void onCreated() override {
        tell("onCreated");
        run(inCreated);
    }
    void onSetContainerProperties(Evas_Object*) override { tell("onSetContainerProperties"); }
    Elm_Object_Item* onPushToNaviframe(Evas_Object* naviframe) override {
        tell("onPushToNaviframe");
        if (!canBePushed)
            return nullptr;
        if (lowest)
            return elm_naviframe_item_insert_before(naviframe, elm_naviframe_top_item_get(naviframe), nullptr, nullptr,
                                                    nullptr, getEvasObj(), nullptr);
        return WView::onPushToNaviframe(naviframe);
    }
    void onPushed(Elm_Object_Item*) override {
        tell("onPushed");
        run(inPushed);
    }
    bool onPop() override {
        tell("onPop");
        return pops;
    }
    void onBecomeTop() override { tell("onBecomeTop"); }
    void onSetAsPageContent() override { tell("onSetAsPageContent"); }
    void onDestroy() override {
        tell("onDestroy");
        run(inDestroy);
    }

private:
    void tell(const char* what) { story_.push_back(name_ + ": " + what); }
    static void run(const std::function<void()>& what) {
        if (what)
            what();
    }

    std::string name_;
    Story& story_;
};
