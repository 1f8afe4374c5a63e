#include "RequestTest.h"

using testing::Contains;
using testing::ElementsAre;

/// Requests to an application that runs.
class LaterRequest : public RequestTest {};

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
