#include "ListTest.h"

#include "KestMainView.h"

using testing::IsEmpty;

/// The list beneath other views.
class ViewsAbove : public ListTest {
protected:
    void startBeneathTwoViews() {
        writeTips({"A"});
        start();
        pushOtherView();
        pushOtherView();
        ASSERT_EQ(levels(), 3U);
    }
};

TEST_F(ViewsAbove, AreClosedOneAtALanguageChange) {
    startBeneathTwoViews();
    setLanguage("ko_KR.UTF-8");
    settle();
    EXPECT_EQ(topView(), "OtherView");
    EXPECT_EQ(levels(), 2U);
}

TEST_F(ViewsAbove, AreClosedOneAtAPackageChange) {
    startBeneathTwoViews();
    device()->events().publishPackage(
        {"com.example.other", device::PackageEvent::Type::Install, device::PackageEvent::State::Completed, 100, 0});
    settle();
    EXPECT_EQ(topView(), "OtherView");
    EXPECT_EQ(levels(), 2U);
}

TEST_F(ViewsAbove, AreClosedBeforeTheCatalogueIsLoadedAtAPackageChange) {
    startBeneathTwoViews();
    newLog();
    std::vector<std::vector<kest_log::Line>> before;
    calls::made().whenPopped = [&] { before.push_back(newLog()); };
    device()->events().publishPackage(
        {"com.example.other", device::PackageEvent::Type::Install, device::PackageEvent::State::Completed, 100, 0});
    settle();
    EXPECT_THAT(before, testing::ElementsAre(IsEmpty()));
    EXPECT_THAT(newLog(), testing::Contains(kest_log::begin("KestContentMgr.cpp", "loadContentsList")));
    calls::made().whenPopped = nullptr;
}

TEST_F(ViewsAbove, AreClosedBeforeTheRowsAreMadeAnewAtALanguageChange) {
    startBeneathTwoViews();
    calls::made().updates = 0;
    std::vector<int> before;
    calls::made().whenPopped = [&] { before.push_back(calls::made().updates); };
    const auto changed = calls::made().smartCallbacks.at("language,changed");
    newLog();
    test_ui::inMainLoop([&] {
        changed(const_cast<void*>(calls::made().rows.back().selectData), nullptr, nullptr);
        EXPECT_EQ(levels(), 2U) << "at once";
        EXPECT_THAT(newLog(),
                    testing::Not(testing::Contains(kest_log::begin("KestContentMgr.cpp", "loadContentsList"))));
    });
    settle();
    EXPECT_THAT(before, testing::ElementsAre(0));
    EXPECT_EQ(levels(), 2U);
    calls::made().whenPopped = nullptr;
}

TEST_F(ViewsAbove, RemainWhenTheListGoesInTheMidstOfALanguageChange) {
    writeTips({"A"});
    start();
    pushOtherView();
    auto* view = new KestMainView(false);
    naviframe().push(view, nullptr, nullptr);
    pushOtherView();
    newLog();
    calls::made().updates = 0;
    const auto changed = calls::made().smartCallbacks.at("language,changed");
    test_ui::inMainLoop([&] {
        changed(view, nullptr, nullptr);
        elm_object_item_del(view->getNaviItem());
    });
    settle();
    EXPECT_EQ(calls::made().updates, 0);
    EXPECT_THAT(newLog(), IsEmpty());
    EXPECT_EQ(levels(), 2U) << "one was closed, and the list went";
    EXPECT_EQ(topView(), "OtherView");
}
