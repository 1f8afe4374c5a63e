#include "PagerTest.h"

#include <device/Launches.h>

using testing::ElementsAre;
using testing::IsEmpty;

/// A link in the text opens the application that the tip is about.
class Launch : public PagerTest {
protected:
    /// Opens a tip with a link and with these further elements.
    void openTip(const std::string& elements, const std::string& text = "Open <a href=app>the application</a>.") {
        writeTips({tip("a_01.png", text, elements)});
        open();
        settle();
        newLog();
    }
    void tapLink(const std::string& href = "app", int index = 0) {
        screen().tap(test_ui::link(entry(index), href).middle());
    }
    std::vector<device::LaunchRequest> requests() const {
        std::vector<device::LaunchRequest> all;
        for (const device::LaunchRecord& record : device()->launches().all())
            all.push_back(record.request);
        return all;
    }
    /// The one request so far: "com.ravella.clock page=alarm".
    std::string request() const {
        const auto all = requests();
        if (all.size() != 1)
            return std::to_string(all.size()) + " requests";
        std::string text = all[0].appId;
        for (const auto& [key, value] : all[0].extras)
            text += " " + key + "=" + value;
        return text;
    }
};

TEST_F(Launch, OpensTheApplicationThatTheTipNames) {
    openTip("<launchappid>com.example.clock</launchappid>");
    tapLink();
    EXPECT_EQ(request(), "com.example.clock");
    EXPECT_EQ(requests()[0].caller, kest);
}

TEST_F(Launch, OpensTheTipsOwnApplicationWhereItNamesNone) {
    openTip("");
    tapLink();
    EXPECT_EQ(request(), kest);
}

TEST_F(Launch, OpensTheTipsOwnApplicationWhereTheNameIsEmpty) {
    openTip("<launchappid></launchappid>");
    tapLink();
    EXPECT_EQ(request(), kest);
}

TEST_F(Launch, OpensTheApplicationThatTheTipBelongsTo) {
    addApplication("com.example.clock");
    writeMenus({{tipPath, "com.example.clock"}});
    writeDetail(tip("a_01.png", "<a href=app>Open</a>"), tipPath, "com.example.clock");
    open();
    settle();
    tapLink();
    EXPECT_EQ(request(), "com.example.clock");
}

TEST_F(Launch, HandsOverKeyAndValue) {
    openTip("<launchappid>com.example.clock</launchappid><launchparamkey>page</launchparamkey>"
            "<launchparamvalue>alarm</launchparamvalue>");
    tapLink();
    EXPECT_EQ(request(), "com.example.clock page=alarm");
}

TEST_F(Launch, HandsOverKeyAndValueToTheTipsOwnApplicationToo) {
    openTip("<launchparamkey>page</launchparamkey><launchparamvalue>alarm</launchparamvalue>");
    tapLink();
    EXPECT_EQ(request(), kest + " page=alarm");
}

TEST_F(Launch, HandsOverNoKeyWithoutAValue) {
    openTip("<launchparamkey>page</launchparamkey>");
    tapLink();
    EXPECT_EQ(request(), kest);
}

TEST_F(Launch, HandsOverNoKeyWithAnEmptyValue) {
    openTip("<launchparamkey>page</launchparamkey><launchparamvalue></launchparamvalue>");
    tapLink();
    EXPECT_EQ(request(), kest);
}

TEST_F(Launch, HandsOverNoValueWithoutAKey) {
    openTip("<launchparamvalue>alarm</launchparamvalue>");
    tapLink();
    EXPECT_EQ(request(), kest);
}

TEST_F(Launch, HandsOverNoValueWithAnEmptyKey) {
    openTip("<launchparamkey></launchparamkey><launchparamvalue>alarm</launchparamvalue>");
    tapLink();
    EXPECT_EQ(request(), kest);
}

TEST_F(Launch, HandsOverWhatAShellWouldTakeForItsOwn) {
    openTip("<launchparamkey>page</launchparamkey><launchparamvalue>$(date); 'x' | y &amp;</launchparamvalue>");
    tapLink();
    EXPECT_EQ(request(), kest + " page=$(date); 'x' | y &");
}

TEST_F(Launch, MakesAndFreesItsRequest) {
    openTip("<launchappid>com.example.clock</launchappid><launchparamkey>page</launchparamkey>"
            "<launchparamvalue>alarm</launchparamvalue>");
    tapLink();
    EXPECT_THAT(calls::steps({"launch"}),
                ElementsAre("launch create", "launch id com.example.clock", "launch extra page alarm",
                            "launch send without a callback", "launch destroy"));
}

TEST_F(Launch, LeavesALine) {
    openTip("<launchappid>com.example.clock</launchappid>");
    tapLink();
    EXPECT_THAT(newLog(), ElementsAre(kest_log::hit("KestContentSubView.cpp", "operator()")));
}

TEST_F(Launch, IsTheSameWhicheverLinkIsTapped) {
    openTip("<launchappid>com.example.clock</launchappid>", "<a href=one>One</a> <a href=two>Two</a>");
    tapLink("two");
    EXPECT_EQ(request(), "com.example.clock");
    tapLink("one");
    ASSERT_EQ(requests().size(), 2U);
    EXPECT_EQ(requests()[1].appId, "com.example.clock");
}

TEST_F(Launch, ComesOnceATap) {
    openTip("");
    for (int tap = 0; tap < 3; ++tap)
        tapLink();
    EXPECT_EQ(requests().size(), 3U);
}

TEST_F(Launch, ComesFromNoOtherPlaceOfTheText) {
    openTip("", "Some words before.<br/><br/><a href=app>Open</a>");
    const test_ui::Rect text = test_ui::geometry(entry());
    screen().tap(test_ui::Point{text.x + 60, text.y + 20});
    EXPECT_THAT(requests(), IsEmpty());
}

TEST_F(Launch, IsThatOfThePageInView) {
    writeTips({tip("a_01.png", "<a href=app>Open</a>", "<launchappid>com.example.one</launchappid>"),
               tip("a_01.png", "<a href=app>Open</a>", "<launchappid>com.example.two</launchappid>")});
    open();
    settle();
    swipe();
    test_ui::runFor(1);
    tapLink("app", 1);
    EXPECT_EQ(request(), "com.example.two");
}

TEST_F(Launch, ThatFailsLeavesThePageAsItIs) {
    openTip("<launchappid>com.example.missing</launchappid>");
    tapLink();
    settle();
    EXPECT_EQ(device()->launches().all().at(0).outcome, device::LaunchOutcome::Failed);
    EXPECT_EQ(topView(), "KestContentView");
    EXPECT_THAT(newErrors(), IsEmpty());
}

TEST_F(Launch, IgnoresWhatTheFrameworkRefuses) {
    openTip("<launchparamkey>page</launchparamkey><launchparamvalue>alarm</launchparamvalue>");
    for (const char* call : {"app_control_set_app_id", "app_control_add_extra_data", "app_control_send_launch_request"})
        device::faults::plan(call, -5);
    tapLink();
    EXPECT_EQ(calls::steps({"launch"}).size(), 5U);
    EXPECT_THAT(newErrors(), IsEmpty());
}

TEST_F(Launch, WithoutMemoryForItsRequestComesToNothing) {
    openTip("");
    device::faults::plan("app_control_create", -12);
    tapLink();
    EXPECT_THAT(requests(), IsEmpty());
    EXPECT_EQ(topView(), "KestContentView");
    EXPECT_THAT(newErrors(), IsEmpty());
}

TEST_F(Launch, WritesNoUsageRecord) {
    openTip("");
    tapLink();
    EXPECT_THAT(device()->usage().all(), IsEmpty());
}
