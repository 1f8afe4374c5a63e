#include "Views.h"

#include "support/TemporaryDevice.h"
#include "ui/UiTest.h"

#include <app-assist/WNaviframe.h>
#include <gmock/gmock.h>

#include <utility>

using app_assist::WNaviframe;
using app_assist::WView;
using testing::ElementsAre;
using testing::IsEmpty;

namespace {

class UnnamedView : public WView {
    Evas_Object* onCreate(Evas_Object* parent, void*) override { return elm_button_add(parent); }
};

class Naviframe : public test_ui::UiTest {
protected:
    Naviframe() {
        naviframe_->create(window(), nullptr);
        evas_object_resize(naviframe_->getEvasObj(), 720, 1280);
        evas_object_show(naviframe_->getEvasObj());
    }
    // The window goes before the naviframe's own object, as at the end of an application.
    ~Naviframe() override {
        if (naviframe_)
            naviframe_->destroy();
    }

    TellingView* make(const char* name) { return new TellingView(name, story_); }

    /// Pushes a view and lets it move in.
    TellingView* push(const char* name) {
        TellingView* view = make(name);
        naviframe_->push(view, nullptr, nullptr);
        test_ui::runFor(0.5);
        return view;
    }

    Evas_Object* evasObject() { return naviframe_->getEvasObj(); }
    void pop() {
        test_ui::inMainLoop([this] { elm_naviframe_item_pop(evasObject()); });
    }
    Story told() { return std::exchange(story_, {}); }

    support::TemporaryDevice device_;
    Story story_;
    std::unique_ptr<WNaviframe> naviframe_ = std::make_unique<WNaviframe>();
};

TEST_F(Naviframe, APushedViewIsCreatedPutOnTheStackAndTold) {
    TellingView* view = make("list");
    EXPECT_EQ(nullptr, view->getNaviframe());
    naviframe_->push(view, "Tips", nullptr);
    EXPECT_THAT(told(), ElementsAre("list: onCreate", "list: onCreated", "list: onSetContainerProperties",
                                    "list: onPushToNaviframe", "list: onPushed", "list: onBecomeTop"));
    EXPECT_EQ(naviframe_.get(), view->getNaviframe());
    EXPECT_EQ(elm_naviframe_top_item_get(evasObject()), view->getNaviItem());
    EXPECT_EQ("Tips", test_ui::itemText(view->getNaviItem()));
    EXPECT_EQ(view, naviframe_->getTopView());
    EXPECT_TRUE(naviframe_->isTopView(view));
    EXPECT_FALSE(naviframe_->isTopView(nullptr));
}

TEST_F(Naviframe, AViewStandsInTheTreeUnderTheNameOfItsClass) {
    auto* view = new UnnamedView();
    naviframe_->push(view, nullptr, nullptr);
    EXPECT_STREQ("(anonymous namespace)::UnnamedView", view->getClassName());
    EXPECT_STREQ(view->getClassName(), evas_object_name_get(view->getEvasObj()));
    EXPECT_STREQ("list", evas_object_name_get(push("list")->getEvasObj()));
}

TEST_F(Naviframe, APoppedViewIsAskedDestroyedAndDeletedAndTheOneBelowBecomesTop) {
    TellingView* list = push("list");
    push("page");
    told();
    pop();
    EXPECT_TRUE(naviframe_->isTopView(list));
    test_ui::runFor(0.5);
    EXPECT_THAT(told(), ElementsAre("page: onPop", "list: onBecomeTop", "page: onDestroy", "page: deleted"));
}

TEST_F(Naviframe, AViewThatDoesNotWantToGoStays) {
    push("list");
    TellingView* page = push("page");
    page->pops = false;
    told();
    pop();
    test_ui::runFor(0.5);
    EXPECT_THAT(told(), ElementsAre("page: onPop"));
    EXPECT_TRUE(naviframe_->isTopView(page));
}

TEST_F(Naviframe, PoppingTheLastViewEndsTheApplicationInstead) {
    TellingView* list = push("list");
    told();
    pop();
    EXPECT_TRUE(test_ui::hasEnded());
    EXPECT_THAT(told(), ElementsAre("list: onPop"));
    EXPECT_TRUE(naviframe_->isTopView(list));
}

TEST_F(Naviframe, TheLastViewMayStillRefuse) {
    push("list")->pops = false;
    pop();
    test_ui::runFor(0.5);
    EXPECT_FALSE(test_ui::hasEnded());
}

class BackKey : public Naviframe, public testing::WithParamInterface<const char*> {};

TEST_P(BackKey, PopsTheTopViewAndOnTheLastEndsTheApplication) {
    push("list");
    push("page");
    told();
    screen().key(GetParam());
    test_ui::runFor(0.5);
    EXPECT_THAT(told(), ElementsAre("page: onPop", "list: onBecomeTop", "page: onDestroy", "page: deleted"));
    ASSERT_FALSE(test_ui::hasEnded());
    screen().key(GetParam());
    EXPECT_TRUE(test_ui::hasEnded());
    EXPECT_THAT(told(), ElementsAre("list: onPop"));
}

TEST_P(BackKey, WorksWhileAReadOnlyTextHasTheFocus) {
    push("list");
    TellingView* page = push("page");
    Evas_Object* entry = elm_entry_add(page->getEvasObj());
    elm_entry_editable_set(entry, EINA_FALSE);
    elm_object_focus_allow_set(entry, EINA_TRUE);
    evas_object_resize(entry, 720, 200);
    evas_object_show(entry);
    screen().key("Shift_L");
    elm_object_focus_set(entry, EINA_TRUE);
    test_ui::runFor(0.1);
    ASSERT_EQ(entry, elm_object_focused_object_get(window()));
    told();
    screen().key(GetParam());
    test_ui::runFor(0.5);
    EXPECT_THAT(told(), ElementsAre("page: onPop", "list: onBecomeTop", "page: onDestroy", "page: deleted"));
}

INSTANTIATE_TEST_SUITE_P(Keys, BackKey, testing::Values("XF86Back", "Escape", "BackSpace"),
                         [](const auto& key) { return std::string(key.param); });

TEST_F(Naviframe, ABackKeyThatComesWhileAViewMovesInIsNotLost) {
    push("list");
    naviframe_->push(make("page"), nullptr, nullptr);
    test_ui::runFor(0.05);
    told();
    test_ui::inMainLoop(
        [this] { evas_event_feed_key_down(screen().canvas(), "XF86Back", "XF86Back", nullptr, nullptr, 0, nullptr); });
    EXPECT_THAT(told(), IsEmpty());
    test_ui::runFor(1.0);
    EXPECT_THAT(told(), ElementsAre("page: onPop", "list: onBecomeTop", "page: onDestroy", "page: deleted"));
}

TEST_F(Naviframe, AViewThatSlidesInBeneathTheTopBecomesTopLater) {
    TellingView* page = push("page");
    told();
    TellingView* list = make("list");
    list->lowest = true;
    naviframe_->push(list, nullptr, nullptr);
    test_ui::runFor(0.5);
    EXPECT_THAT(told(), ElementsAre("list: onCreate", "list: onCreated", "list: onSetContainerProperties",
                                    "list: onPushToNaviframe", "list: onPushed"));
    EXPECT_TRUE(naviframe_->isTopView(page));
    pop();
    test_ui::runFor(0.5);
    EXPECT_THAT(told(), ElementsAre("page: onPop", "list: onBecomeTop", "page: onDestroy", "page: deleted"));
}

TEST_F(Naviframe, AViewThatCannotBeCreatedIsFreedAndSaidInTheLog) {
    TellingView* list = push("list");
    told();
    TellingView* page = make("page");
    page->canBeCreated = false;
    naviframe_->push(page, nullptr, nullptr);
    EXPECT_THAT(told(), ElementsAre("page: onCreate", "page: deleted"));
    EXPECT_TRUE(naviframe_->isTopView(list));
    EXPECT_THAT(device_.logMessages(), ElementsAre("E APP_ASSIST the view page could not be pushed"));
}

TEST_F(Naviframe, AViewThatCannotBePutOnTheStackIsDestroyedAndFreed) {
    push("list");
    told();
    TellingView* page = make("page");
    page->canBePushed = false;
    naviframe_->push(page, nullptr, nullptr);
    EXPECT_THAT(told(), ElementsAre("page: onCreate", "page: onCreated", "page: onSetContainerProperties",
                                    "page: onPushToNaviframe", "page: onDestroy", "page: deleted"));
    EXPECT_THAT(device_.logMessages(), ElementsAre("E APP_ASSIST the view page could not be pushed"));
}

TEST_F(Naviframe, AViewThatDeletesItselfWhileItIsPushedIsDeletedOnce) {
    TellingView* list = push("list");
    told();
    TellingView* page = make("page");
    page->inPushed = [page] { elm_object_item_del(page->getNaviItem()); };
    naviframe_->push(page, nullptr, nullptr);
    test_ui::runFor(0.5);
    EXPECT_THAT(told(), ElementsAre("page: onCreate", "page: onCreated", "page: onSetContainerProperties",
                                    "page: onPushToNaviframe", "page: onPushed", "page: onDestroy", "page: deleted"));
    EXPECT_TRUE(naviframe_->isTopView(list));
}

TEST_F(Naviframe, DeletingTheItemDeletesTheViewOnce) {
    push("list");
    TellingView* page = push("page");
    told();
    elm_object_item_del(page->getNaviItem());
    test_ui::runFor(0.5);
    EXPECT_THAT(told(), ElementsAre("list: onBecomeTop", "page: onDestroy", "page: deleted"));
}

TEST_F(Naviframe, DeletingTheEvasObjectDeletesTheViewOnceAndLeavesNoEmptyItem) {
    TellingView* list = push("list");
    TellingView* page = push("page");
    told();
    evas_object_del(page->getEvasObj());
    test_ui::runFor(0.5);
    EXPECT_THAT(told(), ElementsAre("page: onDestroy", "page: deleted", "list: onBecomeTop"));
    EXPECT_EQ(list->getNaviItem(), elm_naviframe_top_item_get(evasObject()));
}

TEST_F(Naviframe, ClosingTheWindowDeletesEveryViewOnceTheTopOneFirst) {
    push("list");
    push("page");
    told();
    evas_object_del(window());
    EXPECT_THAT(told(), ElementsAre("page: onDestroy", "page: deleted", "list: onDestroy", "list: deleted"));
    EXPECT_EQ(nullptr, naviframe_->getEvasObj());
    EXPECT_EQ(nullptr, naviframe_->getTopView());
}

TEST_F(Naviframe, ItsEndWhileAViewMovesOutDeletesThatViewToo) {
    push("list");
    push("page");
    pop();
    test_ui::runFor(0.05);
    told();
    naviframe_.reset();
    EXPECT_THAT(told(), ElementsAre("list: onDestroy", "list: deleted", "page: onDestroy", "page: deleted"));
}

TEST_F(Naviframe, AViewMayUseItsNaviframeWhileItGoesWithTheWindow) {
    TellingView* list = push("list");
    bool top = true;
    list->inDestroy = [&] { top = list->getNaviframe()->isTopView(list); };
    evas_object_del(window());
    EXPECT_FALSE(top);
}

TEST_F(Naviframe, WithoutAnEvasObjectItFreesWhatIsPushed) {
    naviframe_->destroy();
    told();
    naviframe_->push(make("list"), nullptr, nullptr);
    EXPECT_THAT(told(), ElementsAre("list: deleted"));
}

TEST_F(Naviframe, AnExceptionInAViewStaysOutOfEfl) {
    push("list");
    TellingView* page = push("page");
    page->inDestroy = [] { throw std::runtime_error("no more room"); };
    told();
    pop();
    test_ui::runFor(0.5);
    EXPECT_THAT(told(), ElementsAre("page: onPop", "list: onBecomeTop", "page: onDestroy", "page: deleted"));
    EXPECT_THAT(device_.logMessages(), ElementsAre("E APP_ASSIST a view's onDestroy failed: no more room"));
}

}  // namespace
