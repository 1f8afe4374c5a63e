#include "PagerTest.h"
#include "TimerCalls.h"

#include "KestCommon.h"
#include "KestDemonstration.h"
#include "KestPictureBuilder.h"

#include <optional>

using calls::Timer;
using testing::ElementsAre;
using testing::IsEmpty;

/// A demonstration that goes before the pictures that it plays and before their view.
using DemonstrationEnd = PagerTest;

TEST_F(DemonstrationEnd, LeavesNoStepBehind) {
    const std::string picture = drawPicture("a_01.png", 716, 900);
    startEmpty();
    OtherView* view = new OtherView;
    naviframe().push(view, nullptr, nullptr);
    settle();
    Evas_Object* layout = elm_layout_add(running().window());
    elm_layout_file_set(layout, KestCommon::getEdjFilePath(true).c_str(), "kest/content/main");
    KestPictureArea area(nullptr);
    KestPictureBuilder(area, running().window()).build(layout, picture);
    std::optional<KestDemonstration> demonstration;
    demonstration.emplace(area, *view);
    demonstration->createButtonVertical(area.imageLayout);
    calls::newTimers();
    demonstration->restart();
    test_ui::runFor(0.1);
    ASSERT_TRUE(demonstration->replyHidden());
    ASSERT_THAT(calls::newTimers(), ElementsAre(Timer{2, area.imageLayout}));

    demonstration.reset();
    calls::forget();
    test_ui::runFor(10);
    EXPECT_THAT(calls::story(), IsEmpty());
    EXPECT_THAT(newErrors(), IsEmpty());
    evas_object_del(layout);
}
