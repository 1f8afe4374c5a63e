#include "Views.h"

#include "support/TemporaryDevice.h"
#include "ui/UiTest.h"

#include <app-assist/WUiTimer.h>
#include <gmock/gmock.h>

using app_assist::WUiTimer;
using app_assist::WView;

namespace {

class UiTimer : public test_ui::UiTest {
protected:
    /// Counts its calls and asks to run again.
    WUiTimer::Function again() {
        return [this](WView*) {
            ++calls_;
            return true;
        };
    }
    WUiTimer::Function once() {
        return [this](WView*) {
            ++calls_;
            return false;
        };
    }

    support::TemporaryDevice device_;
    Story story_;
    int calls_ = 0;
};

TEST_F(UiTimer, ATimerRunsAgainAfterTheSameTimeUntilItEnds) {
    const auto handle = WUiTimer::addTimer(
        2.0, [this](WView*) { return ++calls_ < 3; }, nullptr, nullptr);
    test_ui::runFor(1.9);
    EXPECT_EQ(0, calls_);
    test_ui::runFor(0.2);
    EXPECT_EQ(1, calls_);
    EXPECT_FALSE(handle.expired());
    test_ui::runFor(10.0);
    EXPECT_EQ(3, calls_);
    EXPECT_TRUE(handle.expired());
}

TEST_F(UiTimer, AnIdlerRunsAgainUntilItEnds) {
    const auto handle = WUiTimer::addIdler([this](WView*) { return ++calls_ < 3; }, nullptr, nullptr);
    EXPECT_EQ(0, calls_);
    test_ui::runFor(1.0);
    EXPECT_EQ(3, calls_);
    EXPECT_TRUE(handle.expired());
}

TEST_F(UiTimer, AJobRunsOnceWhateverItReturnsAndAfterTheCallbackThatQueuedIt) {
    std::string order;
    WUiTimer::addJob(
        [&](WView*) {
            WUiTimer::addJob(
                [&](WView*) {
                    order += "job ";
                    return true;
                },
                nullptr, nullptr);
            order += "callback ";
            return true;
        },
        nullptr, nullptr);
    test_ui::runFor(1.0);
    EXPECT_EQ("callback job ", order);
}

TEST_F(UiTimer, TheFunctionGetsTheViewOfItsRegistration) {
    TellingView view("page", story_);
    const WView* seen = nullptr;
    WUiTimer::addJob(
        [&](WView* given) {
            seen = given;
            return false;
        },
        &view, nullptr);
    test_ui::runFor(0.1);
    EXPECT_EQ(&view, seen);
}

TEST_F(UiTimer, ADestroyedTimerIsNeverCalledAndDestroyingItAgainIsHarmless) {
    for (const auto& handle :
         {WUiTimer::addTimer(1.0, again(), nullptr, nullptr), WUiTimer::addIdler(again(), nullptr, nullptr),
          WUiTimer::addJob(again(), nullptr, nullptr)}) {
        WUiTimer::destroy(handle);
        EXPECT_TRUE(handle.expired());
        WUiTimer::destroy(handle);
    }
    WUiTimer::destroy({});
    test_ui::runFor(5.0);
    EXPECT_EQ(0, calls_);
}

TEST_F(UiTimer, AFunctionMayReplaceItsOwnTimerAndStillReturnTrue) {
    WUiTimer::Handle pending;
    std::string order;
    const auto replace = [&](double seconds, WUiTimer::Function function) {
        WUiTimer::destroy(pending);
        pending = WUiTimer::addTimer(seconds, std::move(function), nullptr, nullptr);
    };
    // Captured by value: it has to be there still when the timer that holds it was replaced.
    const std::string text(100, 'x');
    replace(1.0, [&, text](WView*) {
        replace(2.0, [&](WView*) {
            order += "advance ";
            return false;
        });
        order += text.size() == 100 ? "touch " : "gone ";
        return true;
    });
    test_ui::runFor(10.0);
    EXPECT_EQ("touch advance ", order);
    EXPECT_TRUE(pending.expired());
}

TEST_F(UiTimer, AFunctionMayDestroyItsOwnTimer) {
    for (const auto add : {WUiTimer::addIdler, WUiTimer::addJob}) {
        WUiTimer::Handle own;
        own = add(
            [&](WView*) {
                WUiTimer::destroy(own);
                ++calls_;
                return true;
            },
            nullptr, nullptr);
        test_ui::runFor(1.0);
        EXPECT_TRUE(own.expired());
    }
    EXPECT_EQ(2, calls_);
}

TEST_F(UiTimer, WhatIsQueuedForAViewThatDiesFirstIsNeverRun) {
    auto view = std::make_unique<TellingView>("page", story_);
    const auto job = WUiTimer::addJob(again(), view.get(), nullptr);
    const auto idler = WUiTimer::addIdler(again(), view.get(), nullptr);
    const auto timer = WUiTimer::addTimer(1.0, again(), view.get(), nullptr);
    view.reset();
    EXPECT_TRUE(job.expired());
    EXPECT_TRUE(idler.expired());
    EXPECT_TRUE(timer.expired());
    test_ui::runFor(5.0);
    EXPECT_EQ(0, calls_);
}

TEST_F(UiTimer, AViewsTimersEndWithItsEvasObject) {
    TellingView view("page", story_);
    view.create(window(), nullptr);
    const auto timer = WUiTimer::addTimer(1.0, again(), &view, nullptr);
    view.destroy();
    EXPECT_TRUE(timer.expired());
    test_ui::runFor(5.0);
    EXPECT_EQ(0, calls_);
}

TEST_F(UiTimer, ATimerEndsWithItsOwnerObject) {
    Evas_Object* owner = elm_button_add(window());
    const auto timer = WUiTimer::addTimer(1.0, again(), nullptr, owner);
    test_ui::runFor(1.5);
    EXPECT_EQ(1, calls_);
    evas_object_del(owner);
    EXPECT_TRUE(timer.expired());
    test_ui::runFor(5.0);
    EXPECT_EQ(1, calls_);
}

TEST_F(UiTimer, AFunctionMayDeleteItsViewAndItsOwner) {
    Evas_Object* owner = elm_button_add(window());
    auto* view = new TellingView("page", story_);
    const auto timer = WUiTimer::addTimer(
        1.0,
        [&](WView* given) {
            delete given;
            evas_object_del(owner);
            ++calls_;
            return true;
        },
        view, owner);
    test_ui::runFor(5.0);
    EXPECT_EQ(1, calls_);
    EXPECT_TRUE(timer.expired());
}

TEST_F(UiTimer, AnOwnerMayOutliveItsTimer) {
    Evas_Object* owner = elm_button_add(window());
    WUiTimer::addJob(once(), nullptr, owner);
    test_ui::runFor(0.1);
    evas_object_del(owner);
    EXPECT_EQ(1, calls_);
}

TEST_F(UiTimer, AnExceptionEndsTheTimerWithALineInTheLog) {
    WUiTimer::addTimer(
        1.0,
        [this](WView*) -> bool {
            ++calls_;
            throw std::runtime_error("no more room");
        },
        nullptr, nullptr);
    test_ui::runFor(5.0);
    EXPECT_EQ(1, calls_);
    EXPECT_THAT(device_.logMessages(), testing::ElementsAre("E APP_ASSIST a timer's function failed: no more room"));
}

TEST_F(UiTimer, NoFunctionIsNoTimer) {
    EXPECT_TRUE(WUiTimer::addTimer(1.0, nullptr, nullptr, nullptr).expired());
    test_ui::runFor(2.0);
}

}  // namespace
