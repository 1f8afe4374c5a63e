#include "PagerTest.h"

#include "ui/Transitions.h"

#include "KestMainView.h"

#include <utility>

using testing::AllOf;
using testing::Contains;
using testing::ElementsAre;
using testing::HasSubstr;
using testing::IsEmpty;

/// How the pager comes onto the screen, and how it goes.
class Opening : public PagerTest {
protected:
    static kest_log::Line info(const std::string& function, const std::string& message) {
        return kest_log::info(pager_log::file, function, message);
    }
    static kest_log::Line begin(const std::string& function) { return kest_log::begin(pager_log::file, function); }
    static kest_log::Line error(const std::string& function, const std::string& message) {
        return kest_log::error(pager_log::file, function, message);
    }
    void writeTipsOfNumber(int count) const {
        std::vector<std::string> tips;
        for (int index = 0; index < count; ++index)
            tips.push_back(tip("none.png", "Text of page " + std::to_string(index)));
        writeTips(tips);
    }
    /// How an object shares the room of its container: across and down.
    static std::pair<double, double> weightOf(const Evas_Object* object) {
        std::pair<double, double> weight;
        evas_object_size_hint_weight_get(object, &weight.first, &weight.second);
        return weight;
    }
    /// How many transitions of the naviframe come to their end within a second.
    int transitions() {
        const test_ui::Transitions transitions(naviframe().getEvasObj());
        test_ui::runFor(1);
        return transitions.finished();
    }
};

TEST_F(Opening, AtTheFirstMenuShowsItsPage) {
    writeTipsOfNumber(3);
    open(0);
    EXPECT_EQ(pageInView(), 0);
    EXPECT_EQ(title(), "Tips 1/3");
    EXPECT_EQ(test_ui::plainText(entry(0)), "Text of page 0");
}

TEST_F(Opening, AtTheLastMenuShowsItsPage) {
    writeTipsOfNumber(3);
    open(2);
    EXPECT_EQ(pageInView(), 2);
    EXPECT_EQ(title(), "Tips 3/3");
    settle();
    EXPECT_EQ(pageInView(), 2);
    EXPECT_EQ(test_ui::geometry(page(2)).x, 0);
}

TEST_F(Opening, HasAPageForEachMenuInTheirOrder) {
    writeTipsOfNumber(4);
    open(1);
    settle();
    for (int index = 0; index < 4; ++index)
        EXPECT_EQ(test_ui::plainText(entry(index)), "Text of page " + std::to_string(index));
    EXPECT_EQ(pager().getPageCount(), 4);
}

TEST_F(Opening, LeavesItsLinesInOrder) {
    writeTipsOfNumber(3);
    push(1);
    test_ui::runFor(1);
    std::vector<kest_log::Line> lines;
    for (const kest_log::Line& line : newLog())
        if (line.file == pager_log::file || line.file == pager_log::pageFile)
            lines.push_back(line);
    const auto page = [](const char* function) { return kest_log::begin(pager_log::pageFile, function); };
    const auto ofPage = [](const std::string& message) {
        return kest_log::info(pager_log::pageFile, "__fillLayout", message);
    };
    const auto imagePath = ofPage("contentList[__index].imagePath is " + picturePath("none.png"));
    const auto height = ofPage("imageHeight: 0");
    EXPECT_THAT(lines,
                ElementsAre(begin("KestContentView"), info("KestContentView", "__selectedView:1"), begin("onCreate"),
                            begin("onPushed"),                   //
                            page("onCreate"), page("onPushed"),  //
                            page("onCreate"), page("onPushed"),  //
                            page("onCreate"), page("onPushed"),  //
                            page("onViewPrepare"), page("__fillLayout"), ofPage("index:1"), imagePath, height,
                            page("onViewDisplay"), info("operator()", "Loading other tabs.."), page("onViewPrepare"),
                            page("__fillLayout"), ofPage("index:0"), imagePath, height, page("onViewPrepare"),
                            page("onViewPrepare"), page("__fillLayout"), ofPage("index:2"), imagePath, height));
}

TEST_F(Opening, SetsItsScrollerUp) {
    writeTipsOfNumber(2);
    open();
    Evas_Object* scroller = pager().getScroller();
    EXPECT_STREQ(elm_object_style_get(scroller), "effect");
    Eina_Bool horizontal = EINA_FALSE, vertical = EINA_TRUE;
    elm_scroller_bounce_get(scroller, &horizontal, &vertical);
    EXPECT_TRUE(horizontal);
    EXPECT_FALSE(vertical);
    Elm_Scroller_Policy horizontalBar{}, verticalBar{};
    elm_scroller_policy_get(scroller, &horizontalBar, &verticalBar);
    EXPECT_EQ(horizontalBar, ELM_SCROLLER_POLICY_OFF);
    EXPECT_EQ(verticalBar, ELM_SCROLLER_POLICY_OFF);
    EXPECT_THAT(calls::steps({"callback scroll,anim", "auto scroll", "unset title_left_btn"}),
                AllOf(Contains("auto scroll off"), Contains("unset title_left_btn")));
}

TEST_F(Opening, SetsItsScrollerUpInOrder) {
    writeTipsOfNumber(2);
    startEmpty();
    calls::forget();
    test_ui::inMainLoop([&] {
        Pager* view = new Pager(2, true);
        view->setShowScroll(true);
        naviframe().push(view, nullptr, nullptr);
    });
    // First the base's own, then the pager's.
    EXPECT_THAT(calls::steps({"bars", "bounce", "callback scroll,anim", "auto scroll"}),
                ElementsAre("bars off off", "bounce on off", "callback scroll,anim,stop", "callback scroll,anim,start",
                            "bounce on off", "bars off off", "auto scroll off"));
}

TEST_F(Opening, WantsAllOfTheRoomForItselfAndForEachPage) {
    writeTipsOfNumber(2);
    open();
    const std::pair<double, double> all{EVAS_HINT_EXPAND, EVAS_HINT_EXPAND};
    EXPECT_EQ(weightOf(pager().getEvasObj()), all);
    EXPECT_EQ(weightOf(page(0)), all);
    EXPECT_EQ(weightOf(page(1)), all);
}

TEST_F(Opening, OnTopSlidesIn) {
    writeTipsOfNumber(2);
    startEmpty();
    naviframe().push(new OtherView, nullptr, nullptr);
    settle();
    push(0, true);
    EXPECT_EQ(topView(), "KestContentView");
    EXPECT_EQ(transitions(), 1);
}

TEST_F(Opening, NotOnTopIsThereAtOnce) {
    writeTipsOfNumber(2);
    startEmpty();
    naviframe().push(new OtherView, nullptr, nullptr);
    settle();
    push(0, false);
    EXPECT_EQ(topView(), "KestContentView");
    EXPECT_EQ(transitions(), 0);
    EXPECT_EQ(pageInView(), 0);
    EXPECT_EQ(title(), "Tips 1/2");
}

TEST_F(Opening, NotOnTopHasTheSameBackButton) {
    writeTipsOfNumber(2);
    startEmpty();
    naviframe().push(new OtherView, "Other", nullptr);
    settle();
    push(0, false);
    settle();
    Evas_Object* back = elm_object_item_part_content_get(pager().getNaviItem(), "elm.swallow.prev_btn");
    EXPECT_STREQ(elm_object_style_get(back), "naviframe/back_btn/default");
    EXPECT_EQ(test_ui::text(back), "") << "the one that naviframes make by themselves names the view below";
    screen().tap(back);
    settle();
    EXPECT_EQ(topView(), "OtherView");
}

TEST_F(Opening, StaysOnTopOfAListThatSlidesInBeneath) {
    writeTipsOfNumber(2);
    open(1);
    naviframe().push(new KestMainView(false), nullptr, nullptr);
    settle();
    EXPECT_EQ(topView(), "KestContentView");
    EXPECT_EQ(pageInView(), 1);
    EXPECT_EQ(title(), "Tips 2/2");
    closePager();
    settle();
    EXPECT_EQ(topView(), "KestMainView");
}

TEST_F(Opening, HasABackButtonThatClosesIt) {
    writeTipsOfNumber(2);
    startEmpty();
    naviframe().push(new OtherView, nullptr, nullptr);
    open();
    settle();
    Evas_Object* back = elm_object_item_part_content_get(pager().getNaviItem(), "elm.swallow.prev_btn");
    EXPECT_STREQ(elm_object_style_get(back), "naviframe/back_btn/default");
    EXPECT_EQ(test_ui::text(back), "");
    screen().tap(back);
    EXPECT_EQ(transitions(), 1);
    EXPECT_EQ(topView(), "OtherView");
}

TEST_F(Opening, IsLaidOutAsAnApplicationsWholeView) {
    writeTipsOfNumber(2);
    open();
    const char* group = nullptr;
    edje_object_file_get(elm_layout_edje_get(pager().getEvasObj()), nullptr, &group);
    EXPECT_STREQ(group, "elm/layout/application/default");
}

TEST_F(Opening, HasABackButtonThatNeedsItsView) {
    writeTipsOfNumber(2);
    startEmpty();
    naviframe().push(new OtherView, nullptr, nullptr);
    push();
    const Evas_Smart_Cb back = calls::smartCallback("clicked");
    settle();
    newLog();
    back(nullptr, nullptr, nullptr);
    settle();
    EXPECT_THAT(newLog(), ElementsAre(error("__backCb", "Invalid Param : data")));
    EXPECT_EQ(topView(), "KestContentView");
}

TEST_F(Opening, BeforeItWasMadeEndsTheProcess) {
    writeTipsOfNumber(2);
    startEmpty();
    Pager view(2, true);
    newLog();
    EXPECT_DEATH(view.onPushToNaviframe(naviframe().getEvasObj()),
                 AllOf(HasSubstr("KestContentView.cpp:"),
                       HasSubstr("onPushToNaviframe: Assertion `(getEvasObj() != nullptr)' failed.")));
    EXPECT_THAT(newErrors(), ElementsAre(error("onPushToNaviframe", "WASSERT! getEvasObj() != nullptr")));
}

TEST_F(Opening, WithoutAnyMenuShowsNoPage) {
    writeMenus({});
    push();
    settle();
    EXPECT_EQ(pager().getPageCount(), 0);
    EXPECT_EQ(topView(), "KestContentView");
    EXPECT_EQ(title(), "");
    push(0, false);
    settle();
    EXPECT_EQ(title(), "");
    EXPECT_THAT(newErrors(), IsEmpty());
}

TEST_F(Opening, AtAMenuThatIsNotThereShowsTheFirstPage) {
    writeTipsOfNumber(2);
    push(7);
    settle();
    EXPECT_EQ(pageInView(), 0);
    EXPECT_EQ(test_ui::plainText(entry(1)), "Text of page 1");
    EXPECT_THAT(newErrors(), IsEmpty());
}
