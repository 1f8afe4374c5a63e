#include "ChangesTest.h"

#include <device/Launches.h>

using testing::ElementsAre;
using testing::IsEmpty;

/// A user's visit, step by step, and the usage record that each step is due, if any.
class Visit : public ChangesTest {
protected:
    /// Does something, waits until it has come to rest, and returns what was recorded meanwhile.
    template <class Step>
    std::vector<std::string> recordedBy(Step&& step) {
        step();
        test_ui::runFor(1);
        EXPECT_THAT(newErrors(), IsEmpty());
        return newRecords();
    }
    std::vector<std::string> launched() const {
        std::vector<std::string> apps;
        for (const device::LaunchRecord& record : device()->launches().all())
            apps.push_back(record.request.appId);
        return apps;
    }
};

TEST_F(Visit, IsRecordedWhereATipIsChosenAndWhereItsButtonIsPressed) {
    EXPECT_THAT(recordedBy([&] { begin(); }), IsEmpty());
    EXPECT_THAT(recordedBy([&] { screen().tap({300, 150}); }), IsEmpty()) << "the title row";
    EXPECT_THAT(recordedBy([&] { screen().swipe({300, 900}, {300, 600}); }), IsEmpty());
    EXPECT_THAT(recordedBy([&] { tapRow(1); }), ElementsAre("KT01 Alarm"));
    EXPECT_THAT(recordedBy([&] { test_ui::runFor(12); }), IsEmpty()) << "pictures that play by themselves";
    EXPECT_THAT(recordedBy([&] { reply(); }), ElementsAre("KT02"));
    EXPECT_THAT(recordedBy([&] { reply(); }), ElementsAre("KT02")) << "while pictures play";
    EXPECT_THAT(recordedBy([&] { swipeToTheNextPage(); }), IsEmpty());
    ASSERT_EQ(top(), "page Tips 3/10: Snooze, How to use Snooze");
    EXPECT_THAT(recordedBy([&] { tapLink(); }), IsEmpty());
    EXPECT_THAT(launched(), ElementsAre("com.example.alarm"));
    EXPECT_THAT(recordedBy([&] { back(); }), IsEmpty());
    ASSERT_EQ(topView(), "KestMainView");
    EXPECT_THAT(recordedBy([&] { tapRow(0); }), ElementsAre("KT01 Clock"));
}

TEST_F(Visit, IsRecordedWhereARequestOpensATip) {
    begin();
    EXPECT_THAT(recordedBy([&] { request({}); }), IsEmpty());
    EXPECT_THAT(recordedBy([&] { request({{"appID", "com.example.music"}}); }), ElementsAre("KT03 Music"));
    ASSERT_EQ(top(), "page Tips 4/10: Music, How to use Music");
    EXPECT_THAT(recordedBy([&] { request({}); }), IsEmpty());
    EXPECT_THAT(recordedBy([&] { request({{"appID", "com.example.nobody"}}); }), IsEmpty());
    EXPECT_THAT(recordedBy([&] { request({{"appID", "com.example.music"}, {"page", "2"}}); }), IsEmpty());
    EXPECT_THAT(recordedBy([&] {
                    request({{"appID", "com.example.alarm"}, {"page", "2"}});
                }),
                ElementsAre("KT03 Snooze"));
    ASSERT_EQ(top(), "page Tips 3/10: Snooze, How to use Snooze");
    EXPECT_THAT(recordedBy([&] {
                    request({{"appID", "com.example.alarm"}});
                }),
                ElementsAre("KT03 Alarm", "KT03 Snooze"));
    EXPECT_THAT(recordedBy([&] { back(); }), IsEmpty());
    ASSERT_EQ(topView(), "KestMainView");
}

TEST_F(Visit, IsRecordedInTheDisplayLanguage) {
    begin();
    setLanguage(Language::Korean);
    test_ui::runFor(1);
    EXPECT_THAT(recordedBy([&] { tapRow(1); }), ElementsAre("KT01 알람"));
    EXPECT_THAT(recordedBy([&] { request({{"appID", "com.example.music"}}); }), ElementsAre("KT03 음악"));
}

TEST_F(Visit, ThatARequestBeginsIsRecordedOnceATip) {
    EXPECT_THAT(recordedBy([&] { begin({"appID=com.example.alarm"}); }), ElementsAre("KT03 Alarm", "KT03 Snooze"));
    EXPECT_EQ(levels(), 3U);
    EXPECT_THAT(recordedBy([&] { back(); }), IsEmpty());
    ASSERT_EQ(top(), "page Tips 2/10: Alarm, How to use Alarm");
    EXPECT_THAT(recordedBy([&] { back(); }), IsEmpty());
    ASSERT_EQ(topView(), "KestMainView");
    EXPECT_THAT(recordedBy([&] { tapRow(3); }), ElementsAre("KT01 Music"));
}

TEST_F(Visit, ThatARequestBeginsForAnUnknownApplicationIsNotRecorded) {
    EXPECT_THAT(recordedBy([&] { begin({"appID=com.example.nobody"}); }), IsEmpty());
    EXPECT_EQ(top(), "nothing");
    EXPECT_THAT(recordedBy([&] { request({{"appID", "com.example.music"}}); }), ElementsAre("KT03 Music"));
}
