#include "RequestTest.h"

#include "ui/Transitions.h"

#include "KestContentMgr.h"

#include <device/Keys.h>

using testing::Contains;
using testing::ElementsAre;

/// Requests to an application that runs.
class LaterRequest : public RequestTest {
protected:
    /// The title on the page that is in view.
    std::string titleInView() {
        for (const Evas_Object* label : test_ui::widgets(naviframe().getTopView()->getEvasObj(), "Elm_Label")) {
            const test_ui::Point middle = test_ui::geometry(label).middle();
            if (middle.x >= 0 && middle.x < 720)
                return test_ui::plainText(label);
        }
        return "";
    }
};

TEST_F(LaterRequest, LeavesTheScreenAsItIsWhereItNamesNoApplication) {
    writeCatalogue();
    start({std::string("appID=") + clockId});
    newLog();
    request({});
    EXPECT_THAT(titles(), ElementsAre("Tips", "Tips 2/4"));
    EXPECT_THAT(newLines(), ElementsAre(begin(), missing("addNoti"), missing("appID")));
}

TEST_F(LaterRequest, OpensTheTipOverTheListWithoutATransition) {
    writeCatalogue();
    start();
    test_ui::inMainLoop([&] {
        requestAtOnce({{"appID", clockId}});
        EXPECT_THAT(views(), ElementsAre("KestMainView", "KestContentView"));
    });
    settle();
    EXPECT_THAT(titles(), ElementsAre("Tips", "Tips 2/4"));
    EXPECT_THAT(usage(), ElementsAre("KT03 Clock"));
}

TEST_F(LaterRequest, TurnsThePagerThatIsOpen) {
    writeCatalogue();
    start({std::string("appID=") + clockId});
    newLog();
    request({{"appID", doorId}, {"page", "3"}});
    EXPECT_THAT(titles(), ElementsAre("Tips", "Tips 4/4"));
    EXPECT_THAT(usage(), ElementsAre("KT03 Clock", "KT03 Lock"));
    EXPECT_THAT(newLog(), Contains(kest_log::info("KestContentView.cpp", "showContentsPage", "change view page to 3")));
}

TEST_F(LaterRequest, TurnsThePagerUnderAFingerThatDragsIt) {
    writeCatalogue();
    start({std::string("appID=") + clockId});
    screen().press({600, 400});
    for (int x = 580; x >= 300; x -= 20) {
        test_ui::runFor(0.02);
        screen().moveTo({x, 400});
        if (x == 440)
            request({{"appID", doorId}, {"page", "3"}});
    }
    screen().lift();
    settle();
    EXPECT_THAT(titles(), ElementsAre("Tips", "Tips 4/4"));
    EXPECT_THAT(titleInView(), testing::HasSubstr("Lock"));
    EXPECT_THAT(usage(), ElementsAre("KT03 Clock", "KT03 Lock"));
}

TEST_F(LaterRequest, TurnsThePagerToTheLastOfSeveralTips) {
    writeCatalogue();
    start();
    request({{"appID", doorId}});
    EXPECT_THAT(titles(), ElementsAre("Tips", "Tips 4/4"));
    EXPECT_THAT(usage(), ElementsAre("KT03 Open", "KT03 Close", "KT03 Lock"));
}

TEST_F(LaterRequest, TurnsThePagerBeforeTheListHasComeInBeneathIt) {
    writeCatalogue();
    startWithoutView();
    test_ui::inMainLoop([&] {
        requestAtOnce({{"appID", clockId}}, true);
        requestAtOnce({{"appID", doorId}, {"page", "3"}});
    });
    settle();
    EXPECT_THAT(titles(), ElementsAre("Tips", "Tips 4/4"));
    EXPECT_THAT(usage(), ElementsAre("KT03 Clock", "KT03 Lock"));
}

TEST_F(LaterRequest, OpensANewPagerInPlaceOfOneOfAnOlderCatalogue) {
    writeCatalogue();
    start({std::string("appID=") + doorId});
    ASSERT_THAT(titles(), ElementsAre("Tips", "Tips 1/4", "Tips 3/4", "Tips 4/4"));
    writeMenus({{"contents/Lock.xml", doorId}, {"contents/Clock.xml", clockId}});
    KestContentMgr::getInstance()->loadContentsList(true);
    request({{"appID", clockId}});
    EXPECT_THAT(titles(), ElementsAre("Tips", "Tips 1/4", "Tips 3/4", "Tips 2/2"));
    EXPECT_THAT(titleInView(), testing::HasSubstr("Clock"));
    EXPECT_EQ(usage().back(), "KT03 Clock");
    EXPECT_THAT(kest_log::ofLevel('E', newLog()), testing::IsEmpty());
    naviframe().back();
    settle();
    EXPECT_THAT(views(), ElementsAre("KestMainView", "KestContentView", "KestContentView"));
}

TEST_F(LaterRequest, IsForAMenuThatHasComeSinceThePagerOpened) {
    writeCatalogue();
    writeMenus({{"contents/Open.xml", doorId}});
    start({std::string("appID=") + doorId});
    writeCatalogue();
    KestContentMgr::getInstance()->loadContentsList(true);
    request({{"appID", clockId}});
    EXPECT_THAT(titles(), ElementsAre("Tips", "Tips 2/4"));
}

TEST_F(LaterRequest, HasItsPageKeepItsNumberWhenTheThemeChanges) {
    writeCatalogue();
    start({std::string("appID=") + clockId});
    request({{"appID", doorId}, {"page", "3"}});
    device()->settings().set(device::keys::theme, "dark");
    settle();
    EXPECT_THAT(titles(), ElementsAre("Tips", "Tips 4/4"));
}

TEST_F(LaterRequest, HasNoTransition) {
    writeCatalogue();
    start();
    const test_ui::Transitions transitions(naviframe().getEvasObj());
    request({{"appID", clockId}});
    EXPECT_EQ(transitions.finished(), 0);
    naviframe().back();
    settle();
    EXPECT_EQ(transitions.finished(), 1) << "this one has";
}

TEST_F(LaterRequest, IsRecordedWhenItsPagerIsThere) {
    writeCatalogue();
    start();
    std::vector<std::string> viewsThen;
    calls::whenARecordIsWritten([&] { viewsThen = views(); });
    request({{"appID", clockId}});
    EXPECT_THAT(viewsThen, ElementsAre("KestMainView", "KestContentView"));
    calls::whenARecordIsWritten(nullptr);
}

TEST_F(LaterRequest, ToAnEmptyScreenLeavesNothingToGoBackTo) {
    writeCatalogue();
    start({"appID=com.example.none"});
    request({{"appID", clockId}});
    test_ui::inMainLoop([&] { naviframe().back(); });
    EXPECT_TRUE(test_ui::hasEnded());
}

TEST_F(LaterRequest, ToAnEmptyScreenHasABackButtonThatLeadsOut) {
    writeCatalogue();
    start({"appID=com.example.none"});
    request({{"appID", clockId}});
    ASSERT_FALSE(test_ui::hasEnded());
    screen().tap(elm_object_item_part_content_get(naviframe().getTopView()->getNaviItem(), "elm.swallow.prev_btn"));
    EXPECT_TRUE(test_ui::hasEnded());
}

TEST_F(LaterRequest, IsNotWaitedForByAnEmptyScreenThatIsLeft) {
    writeCatalogue();
    start({"appID=com.example.none"});
    EXPECT_FALSE(test_ui::hasEnded());
    screen().key("XF86Back");
    EXPECT_TRUE(test_ui::hasEnded());
}

TEST_F(LaterRequest, OpensTheTipAnewWhenThePagerWasClosed) {
    writeCatalogue();
    start({std::string("appID=") + clockId});
    naviframe().back();
    settle();
    request({{"appID", clockId}});
    EXPECT_THAT(titles(), ElementsAre("Tips", "Tips 2/4"));
}

TEST_F(LaterRequest, RecordsATipWithoutATitle) {
    addApplication(clockId);
    writeMenus({{"contents/tip.xml", clockId}});
    writeDetail("<title></title>", "contents/tip.xml", clockId);
    start({std::string("appID=") + clockId});
    ASSERT_EQ(device()->usage().all().size(), 1U);
    EXPECT_EQ(device()->usage().all()[0].values.size(), 3U) << "its title is there, be it empty";
}

TEST_F(LaterRequest, LeavesNoListBehindThatNeverCameOntoTheScreen) {
    writeCatalogue();
    startWithoutView();
    test_ui::inMainLoop([&] {
        requestAtOnce({{"appID", clockId}}, true);
        elm_exit();
    });
    running_.reset();
    EXPECT_EQ(app_.getWindow(), nullptr);
}
