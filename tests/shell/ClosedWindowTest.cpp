#include "RequestTest.h"

using testing::ElementsAre;

/// The application's window, closed while the application runs, which takes the views along.
class ClosedWindow : public RequestTest {
protected:
    void close() {
        errorsBefore_ = errors();
        evas_object_del(running().window());
    }
    void expectAQuietEnd() {
        EXPECT_TRUE(test_ui::hasEnded());
        running_.reset();
        EXPECT_EQ(app_.getWindow(), nullptr);
        EXPECT_EQ(errors(), errorsBefore_);
    }

private:
    /// Of whoever wrote them.
    std::vector<std::string> errors() const {
        std::vector<std::string> found = device().logMessages();
        std::erase_if(found, [](const std::string& message) { return message.rfind("E ", 0) != 0; });
        return found;
    }

    std::vector<std::string> errorsBefore_;
};

TEST_F(ClosedWindow, OverTheListEndsTheApplication) {
    writeCatalogue();
    start();
    ASSERT_THAT(views(), ElementsAre("KestMainView"));
    test_ui::inMainLoop([&] { close(); });
    expectAQuietEnd();
}

TEST_F(ClosedWindow, OverARequestedPagerEndsTheApplication) {
    writeCatalogue();
    start({std::string("appID=") + clockId});
    ASSERT_THAT(views(), ElementsAre("KestMainView", "KestContentView"));
    test_ui::inMainLoop([&] { close(); });
    expectAQuietEnd();
}

TEST_F(ClosedWindow, BeforeTheListHasComeInBeneathThePagerEndsTheApplication) {
    writeCatalogue();
    startWithoutView();
    test_ui::inMainLoop([&] {
        requestAtOnce({{"appID", clockId}}, true);
        ASSERT_THAT(views(), ElementsAre("KestContentView"));
        close();
    });
    expectAQuietEnd();
}

TEST_F(ClosedWindow, ByItsUserEndsTheApplication) {
    writeCatalogue();
    start();
    test_ui::inMainLoop([&] { evas_object_smart_callback_call(running().window(), "delete,request", nullptr); });
    expectAQuietEnd();
}
