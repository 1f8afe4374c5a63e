#include "ListTest.h"

#include "ui/Transitions.h"

using testing::Contains;
using testing::ElementsAre;
using testing::IsEmpty;
using testing::Pair;

using Tap = ListTest;

TEST_F(Tap, OnTheFirstMenuOpensThePagerAtIt) {
    writeTips({"A", "B"});
    start();
    newLog();
    tap(menuRow(0));
    const auto lines = newLog();
    ASSERT_GE(lines.size(), 4U);
    EXPECT_EQ(lines[0], list_log::info("__selectItemCb", "selected index:2"));
    EXPECT_EQ(lines[1], kest_log::begin("KestContentView.cpp", "KestContentView"));
    EXPECT_EQ(lines[2], kest_log::info("KestContentView.cpp", "KestContentView", "__selectedView:0"));
    EXPECT_EQ(lines[3], kest_log::begin("KestContentView.cpp", "onCreate"));
    EXPECT_EQ(topView(), "KestContentView");
}

TEST_F(Tap, SlidesThePagerIn) {
    writeTips({"A"});
    start();
    const test_ui::Transitions transitions(naviframe().getEvasObj());
    openPager();
    EXPECT_EQ(transitions.finished(), 1);
}

TEST_F(Tap, OnALaterMenuOpensThePagerAtThatOne) {
    writeTips({"A", "B", "C"});
    start();
    newLog();
    tap(menuRow(2));
    const auto lines = newLog();
    EXPECT_THAT(lines, Contains(list_log::info("__selectItemCb", "selected index:4")));
    EXPECT_THAT(lines, Contains(kest_log::info("KestContentView.cpp", "KestContentView", "__selectedView:2")));
}

TEST_F(Tap, WritesOneUsageRecord) {
    writeTips({"A", "B"});
    start();
    tap(menuRow(1));
    settle();
    const auto records = device()->usage().all();
    ASSERT_EQ(records.size(), 1U);
    EXPECT_THAT(records[0].uri, testing::MatchesRegex("content://[^/]+/log/use_app_feature_survey"));
    EXPECT_THAT(records[0].values,
                ElementsAre(Pair("app_id", "com.ravella.kest"), Pair("extra", "B"), Pair("feature", "KT01")));
}

TEST_F(Tap, WritesARecordForAMenuWithoutATitleToo) {
    writeTip("<title></title>");
    start();
    tap(menuRow(0));
    EXPECT_THAT(usageExtras(), ElementsAre(""));
}

TEST_F(Tap, WritesItsRecordBeforeThePagerIsThere) {
    writeTips({"A"});
    start();
    newLog();
    std::vector<kest_log::Line> linesBefore;
    std::string topBefore;
    calls::made().whenRecorded = [&] {
        linesBefore = newLog();
        topBefore = topView();
    };
    openPager();
    EXPECT_THAT(linesBefore, ElementsAre(list_log::info("__selectItemCb", "selected index:2")));
    EXPECT_EQ(topBefore, "KestMainView");
    calls::made().whenRecorded = nullptr;
}

TEST_F(Tap, LeavesTheRowUnselected) {
    writeTips({"A", "B"});
    start();
    tap(menuRow(0));
    EXPECT_EQ(elm_genlist_selected_item_get(list()), nullptr);
    EXPECT_FALSE(elm_genlist_item_selected_get(menuRow(0)));
}

TEST_F(Tap, OpensAndWritesEveryTime) {
    writeTips({"A", "B"});
    start();
    openPager(0);
    screen().key("XF86Back");
    settle();
    ASSERT_EQ(topView(), "KestMainView");
    openPager(0);
    screen().key("XF86Back");
    settle();
    openPager(1);
    EXPECT_THAT(usageExtras(), ElementsAre("A", "A", "B"));
}

TEST_F(Tap, OnTheTitleDoesNothing) {
    writeTips({"A"});
    start();
    newLog();
    tap(titleRow());
    settle();
    EXPECT_THAT(newLog(), IsEmpty());
    EXPECT_EQ(topView(), "KestMainView");
    EXPECT_THAT(usageExtras(), IsEmpty());
}

TEST_F(Tap, TitleCannotBeSelectedOtherwiseEither) {
    writeTips({"A"});
    start();
    EXPECT_EQ(elm_genlist_item_select_mode_get(titleRow()), ELM_OBJECT_SELECT_MODE_DISPLAY_ONLY);
    elm_genlist_item_selected_set(titleRow(), EINA_TRUE);
    EXPECT_FALSE(elm_genlist_item_selected_get(titleRow()));
}

TEST_F(Tap, ThatBecomesASwipeOpensNothing) {
    writeTips({"A", "B", "C"});
    start();
    const test_ui::Point from = test_ui::rowGeometry(menuRow(2)).middle();
    screen().swipe(from, {from.x, from.y - 200});
    settle();
    EXPECT_EQ(topView(), "KestMainView");
    EXPECT_THAT(usageExtras(), IsEmpty());
}

TEST_F(Tap, OpensThePagerEvenWhenTheUsageLogFails) {
    writeTips({"A"});
    start();
    device::faults::plan("ravella_log_manager_create", -5);
    device::faults::plan("ravella_log_manager_insert", -5);
    newLog();
    tap(menuRow(0));
    EXPECT_EQ(topView(), "KestContentView");
    EXPECT_THAT(newErrors(), IsEmpty());
    EXPECT_THAT(device()->usage().all(), IsEmpty());
}

TEST_F(Tap, BackButtonOfThePagerClosesIt) {
    writeTips({"A"});
    start();
    openPager();
    Evas_Object* back =
        elm_object_item_part_content_get(naviframe().getTopView()->getNaviItem(), "elm.swallow.prev_btn");
    ASSERT_NE(back, nullptr);
    EXPECT_STREQ(elm_object_style_get(back), "naviframe/back_btn/default");
    screen().tap(back);
    settle();
    EXPECT_EQ(topView(), "KestMainView");
}

TEST_F(Tap, WithoutAnItemIsAnErrorLine) {
    writeTips({"A"});
    start();
    const calls::Row row = calls::made().rows.at(1);
    newLog();
    row.select(const_cast<void*>(row.selectData), list(), nullptr);
    EXPECT_THAT(newLog(), ElementsAre(list_log::error("__selectItemCb", "event_info is NULL")));
    row.select(nullptr, list(), nullptr);
    EXPECT_THAT(newLog(), ElementsAre(list_log::error("__selectItemCb", "event_info is NULL")));
    EXPECT_EQ(topView(), "KestMainView");
}

TEST_F(Tap, WithoutAViewIsAnErrorLine) {
    writeTips({"A"});
    start();
    newLog();
    calls::made().rows.at(1).select(nullptr, list(), menuRow(0));
    EXPECT_THAT(newLog(), ElementsAre(list_log::error("__selectItemCb", "data is NULL")));
    EXPECT_EQ(topView(), "KestMainView");
    EXPECT_THAT(usageExtras(), IsEmpty());
}

TEST_F(Tap, WithoutMemoryForItOpensNothingAndLeavesALine) {
    writeTips({"A"});
    start();
    calls::made().outOfMemory = true;
    const auto& rows = calls::made().rows;
    rows.at(1).select(const_cast<void*>(rows.at(1).selectData), list(), menuRow(0));
    EXPECT_THAT(newErrors(), ElementsAre(list_log::error("__selectItemCb", "std::bad_alloc")));
    EXPECT_EQ(topView(), "KestMainView");
    EXPECT_THAT(usageExtras(), IsEmpty());
}
