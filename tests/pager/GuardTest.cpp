#include "PagerTest.h"

#include <device/Keys.h>

using testing::ElementsAre;
using testing::IsEmpty;

/// What the toolkit calls lets nothing out that is thrown; the log has it, and the pager goes on.
class Guard : public PagerTest {
protected:
    void openAtRest() {
        drawSequence(2);
        writeTips({tip("a_01.png", "<a href=app>Open</a>"), tip("a_01.png")});
        rest();
    }
    void openTallAtRest() {
        drawPicture("a_01.png", 716, 1000);
        writeTip();
        rest();
    }
    void rest() {
        open();
        test_ui::runFor(6);
        newLog();
        calls::forget();
    }
    static kest_log::Line error(const std::string& file, const std::string& function, const std::string& call) {
        return kest_log::error(file, function, call + " failed");
    }
    static constexpr char demonstrationFile[] = "KestDemonstration.cpp";
    static constexpr char titleCall[] = "elm_object_item_domain_translatable_part_text_set";
};

TEST_F(Guard, StandsBeforeATappedLink) {
    openAtRest();
    calls::throwIn("app_control_create");
    screen().tap(test_ui::link(entry(), "app").middle());
    EXPECT_THAT(newErrors(), ElementsAre(error(pager_log::pageFile, "operator()", "app_control_create")));
    EXPECT_THAT(device()->launches().all(), IsEmpty());
    screen().tap(test_ui::link(entry(), "app").middle());
    EXPECT_EQ(device()->launches().all().size(), 1U);
}

TEST_F(Guard, StandsBeforeAChangeOfTheTheme) {
    openAtRest();
    calls::throwIn(titleCall);
    device()->settings().set(device::keys::theme, "dark");
    settle();
    EXPECT_THAT(newErrors(), ElementsAre(error(pager_log::pageFile, "__themeChangedCb", titleCall)));
}

TEST_F(Guard, StandsBeforeAChangeOfTheLanguage) {
    openAtRest();
    calls::throwIn("addTimer");
    setLanguage("ko_KR.UTF-8");
    test_ui::runFor(1);
    EXPECT_THAT(newErrors(), ElementsAre(error(pager_log::pageFile, "__languageChangedCb", "addTimer")));
}

TEST_F(Guard, StandsBeforeThePressedButton) {
    openAtRest();
    calls::throwIn("elm_object_signal_emit");
    pressReply();
    EXPECT_THAT(newErrors(), ElementsAre(error(demonstrationFile, "__sequencePressedCb", "elm_object_signal_emit")));
    releaseReply();
    EXPECT_THAT(calls::story(), ElementsAre("0.0 record", "0.0 area reply,hide", "0.0 picture 0 touch,hide"));
}

TEST_F(Guard, StandsBeforeTheReleasedButton) {
    openAtRest();
    calls::throwIn("elm_object_signal_emit");
    releaseReply();
    EXPECT_THAT(newErrors(), ElementsAre(error(demonstrationFile, "__sequenceReleasedCb", "elm_object_signal_emit")));
    releaseReply();
    EXPECT_THAT(calls::story(), ElementsAre("0.0 area reply,hide", "0.0 picture 0 touch,hide"));
}

TEST_F(Guard, StandsBeforeThePressedButtonOfATallPicture) {
    openTallAtRest();
    calls::throwIn("elm_object_signal_emit");
    pressReply();
    EXPECT_THAT(newErrors(), ElementsAre(error(demonstrationFile, "__tallPressedCb", "elm_object_signal_emit")));
}

TEST_F(Guard, StandsBeforeTheReleasedButtonOfATallPicture) {
    openTallAtRest();
    calls::throwIn("elm_object_signal_emit");
    releaseReply();
    EXPECT_THAT(newErrors(), ElementsAre(error(demonstrationFile, "__tallReleasedCb", "elm_object_signal_emit")));
    releaseReply();
    EXPECT_THAT(calls::story(), ElementsAre("0.0 area reply,hide"));
}

TEST_F(Guard, StandsBeforeTheBeginOfAMovement) {
    openAtRest();
    calls::throwIn("elm_scroller_page_show");
    swipe();
    test_ui::runFor(1);
    EXPECT_THAT(newErrors(), ElementsAre(error(pager_log::file, "__pageScrollStartCb", "elm_scroller_page_show")));
    EXPECT_EQ(title(), "Tips 2/2");
}

TEST_F(Guard, StandsBeforeTheEndOfAMovement) {
    openAtRest();
    calls::throwIn(titleCall);
    swipe();
    test_ui::runFor(1);
    EXPECT_THAT(newErrors(), ElementsAre(error(pager_log::file, "__pageScrollStopCb", titleCall)));
    EXPECT_EQ(pageInView(), 1);
}

/// What is called for nothing says so in the log, and does nothing.
class CallWithoutData : public Guard {
protected:
    /// The theme's signal, as the page's layout would hear it.
    static void signal(const char* name) { calls::signalCallback(name)(nullptr, nullptr, name, ""); }
    static kest_log::Line noData(const std::string& file, const std::string& function) {
        return kest_log::error(file, function, "data is null");
    }
};

TEST_F(CallWithoutData, OfTheReplyButtonIsAnErrorLine) {
    openAtRest();
    signal("reply,pressed");
    signal("reply,uppressed");
    EXPECT_THAT(newErrors(), ElementsAre(noData(demonstrationFile, "__sequencePressedCb"),
                                         noData(demonstrationFile, "__sequenceReleasedCb")));
    EXPECT_THAT(calls::story(), IsEmpty());
}

TEST_F(CallWithoutData, OfTheReplyButtonOfATallPictureIsAnErrorLine) {
    openTallAtRest();
    signal("reply,pressed");
    signal("reply,uppressed");
    EXPECT_THAT(newErrors(), ElementsAre(noData(demonstrationFile, "__tallPressedCb"),
                                         noData(demonstrationFile, "__tallReleasedCb")));
    EXPECT_THAT(calls::story(), IsEmpty());
}

TEST_F(CallWithoutData, OfAMovementsBeginningAndEndIsAnErrorLine) {
    openAtRest();
    calls::smartCallback("scroll,anim,start")(nullptr, nullptr, nullptr);
    calls::smartCallback("scroll,anim,stop")(nullptr, nullptr, nullptr);
    EXPECT_THAT(newErrors(), ElementsAre(noData(pager_log::file, "__pageScrollStartCb"),
                                         noData(pager_log::file, "__pageScrollStopCb")));
    EXPECT_THAT(calls::story(), IsEmpty());
}

TEST_F(CallWithoutData, OfALinkIsAnErrorLine) {
    openAtRest();
    calls::smartCallback("anchor,clicked")(nullptr, nullptr, nullptr);
    EXPECT_THAT(newErrors(), ElementsAre(noData(pager_log::pageFile, "operator()")));
    EXPECT_THAT(device()->launches().all(), IsEmpty());
}
