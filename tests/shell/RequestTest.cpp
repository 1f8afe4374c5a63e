#include "RequestTest.h"

#include "ui/Transitions.h"

#include <app-assist/WWindow.h>
#include <device/Faults.h>

#include <algorithm>
#include <map>

using testing::Contains;
using testing::ElementsAre;
using testing::IsEmpty;
using testing::IsSupersetOf;
using testing::Not;

void RequestTest::writeCatalogue() const {
    const std::vector<std::pair<std::string, std::string>> tips = {
        {doorId, "Open"}, {clockId, "Clock"}, {doorId, "Close"}, {doorId, "Lock"}};
    addApplication(doorId);
    addApplication(clockId);
    std::vector<kest_files::Menu> menus;
    for (const auto& [id, title] : tips) {
        const std::string path = "contents/" + title + ".xml";
        menus.push_back({path, id});
        writeDetail("<title>" + title + "</title>", path, id);
    }
    writeMenus(menus);
}

void RequestTest::startWithoutView() {
    app_.takesRequests = false;
    start();
    app_.takesRequests = true;
}

void RequestTest::requestAtOnce(const Extras& extras, bool first) {
    app_control_h handle = nullptr;
    ASSERT_EQ(app_control_create(&handle), APP_CONTROL_ERROR_NONE);
    for (const auto& [key, value] : extras)
        ASSERT_EQ(app_control_add_extra_data(handle, key.c_str(), value.c_str()), APP_CONTROL_ERROR_NONE);
    app_.onAppControl(handle, first);
    app_control_destroy(handle);
}

void RequestTest::request(const Extras& extras) {
    test_ui::inMainLoop([&] { requestAtOnce(extras); });
    settle();
}

std::vector<Elm_Object_Item*> RequestTest::items() {
    std::vector<Elm_Object_Item*> all;
    Eina_List* list = elm_naviframe_items_get(naviframe().getEvasObj());
    const Eina_List* node = nullptr;
    void* item = nullptr;
    EINA_LIST_FOREACH(list, node, item) {
        all.push_back(static_cast<Elm_Object_Item*>(item));
    }
    eina_list_free(list);
    return all;
}

std::vector<std::string> RequestTest::views() {
    std::vector<std::string> names;
    for (Elm_Object_Item* item : items())
        names.emplace_back(evas_object_name_get(elm_object_item_content_get(item)));
    return names;
}

std::vector<std::string> RequestTest::titles() {
    std::vector<std::string> texts;
    for (Elm_Object_Item* item : items())
        texts.push_back(test_ui::itemText(item, "elm.text.title"));
    return texts;
}

std::vector<std::string> RequestTest::usage() const {
    std::vector<std::string> records;
    for (const device::UsageRecord& record : device()->usage().all()) {
        const std::map<std::string, std::string> values(record.values.begin(), record.values.end());
        EXPECT_EQ(values.at("app_id"), kest);
        records.push_back(values.at("feature") + " " + values.at("extra"));
    }
    return records;
}

std::vector<kest_log::Line> RequestTest::newLines() {
    std::vector<kest_log::Line> lines = newLog();
    std::erase_if(lines, [](const kest_log::Line& line) { return line.file != file; });
    return lines;
}

// The first request of all.

TEST_F(RequestTest, ShowsTheListWhereItNamesNoApplication) {
    writeCatalogue();
    start();
    EXPECT_THAT(views(), ElementsAre("KestMainView"));
    EXPECT_THAT(usage(), IsEmpty());
    EXPECT_THAT(newLines(), IsSupersetOf({begin(), missing("addNoti"), missing("appID")}));
}

TEST_F(RequestTest, ShowsTheListWhereItsWordsCannotBeRead) {
    writeCatalogue();
    device::faults::plan("app_control_get_extra_data", APP_CONTROL_ERROR_OUT_OF_MEMORY, 2);
    start({"LaunchingType=addNoti", std::string("appID=") + clockId});
    EXPECT_THAT(views(), ElementsAre("KestMainView"));
    EXPECT_THAT(newLines(), IsSupersetOf({begin(), missing("addNoti"), missing("appID")}));
    EXPECT_THAT(device()->notifications().all(), IsEmpty());
    EXPECT_FALSE(test_ui::hasEnded());
}

TEST_F(RequestTest, OpensTheFirstTipWhereItsPageCannotBeRead) {
    writeCatalogue();
    device::faults::plan("app_control_get_extra_data", APP_CONTROL_ERROR_OUT_OF_MEMORY, 1, 2);
    start({std::string("appID=") + doorId, "page=3"});
    EXPECT_THAT(usage(), ElementsAre("KT03 Open", "KT03 Close", "KT03 Lock"));
    EXPECT_THAT(newLines(), Contains(missing("page")));
}

TEST_F(RequestTest, ShowsTheListWhereTheApplicationIsNamedByAnEmptyText) {
    writeCatalogue();
    start({"appID="});
    EXPECT_THAT(views(), ElementsAre("KestMainView"));
    EXPECT_THAT(newLines(), Not(Contains(missing("appID"))));
}

TEST_F(RequestTest, OpensTheTipOfAnApplicationWithTheListBeneath) {
    writeCatalogue();
    start({std::string("appID=") + clockId});
    EXPECT_THAT(views(), ElementsAre("KestMainView", "KestContentView"));
    EXPECT_THAT(titles(), ElementsAre("Tips", "Tips 2/4"));
    EXPECT_THAT(usage(), ElementsAre("KT03 Clock"));
}

TEST_F(RequestTest, SaysStepByStepWhatItDoes) {
    writeCatalogue();
    start({std::string("appID=") + clockId});
    EXPECT_THAT(newLines(), ElementsAre(begin(), missing("addNoti"),
                                        info(std::string("Appcontrol case from ") + clockId), missing("page")));
}

TEST_F(RequestTest, LeadsBackToTheList) {
    writeCatalogue();
    start({std::string("appID=") + clockId});
    naviframe().back();
    settle();
    EXPECT_THAT(views(), ElementsAre("KestMainView"));
    EXPECT_FALSE(test_ui::hasEnded());
    test_ui::inMainLoop([&] { naviframe().back(); });
    EXPECT_TRUE(test_ui::hasEnded());
}

TEST_F(RequestTest, PushesThePagerFirstAndTheListWhenTheMainLoopIsIdle) {
    writeCatalogue();
    startWithoutView();
    calls::forget();
    test_ui::inMainLoop([&] {
        requestAtOnce({{"appID", clockId}}, true);
        EXPECT_THAT(views(), ElementsAre("KestContentView"));
        EXPECT_THAT(calls::madeOf({"addIdler"}), ElementsAre("addIdler Elm_Layout", "addIdler Elm_Naviframe"));
    });
    settle();
    EXPECT_THAT(views(), ElementsAre("KestMainView", "KestContentView"));
    EXPECT_THAT(calls::madeOf({"idlerRan Elm_Naviframe"}), ElementsAre("idlerRan Elm_Naviframe once"));
}

TEST_F(RequestTest, MakesTheListBeforeThePager) {
    writeCatalogue();
    startWithoutView();
    newLog();
    requestAtOnce({{"appID", clockId}}, true);
    const auto lines = newLog();
    const auto list = std::find(
        lines.begin(), lines.end(),
        kest_log::info("KestCommon.cpp", "getEdjFilePath", "edje resource path[" + resource("edje/kest.edj") + "]"));
    const auto pager = std::find(lines.begin(), lines.end(), kest_log::begin("KestContentView.cpp", "KestContentView"));
    ASSERT_NE(pager, lines.end());
    EXPECT_LT(list, pager);
}

TEST_F(RequestTest, OpensAllTipsOfTheApplicationFromThatPageOnOverOneList) {
    writeCatalogue();
    start({std::string("appID=") + doorId, "page=2"});
    EXPECT_THAT(views(), ElementsAre("KestMainView", "KestContentView", "KestContentView"));
    EXPECT_THAT(titles(), ElementsAre("Tips", "Tips 3/4", "Tips 4/4"));
    EXPECT_THAT(usage(), ElementsAre("KT03 Close", "KT03 Lock"));
}

TEST_F(RequestTest, SlidesFurtherPagersInOverTheFirst) {
    writeCatalogue();
    startWithoutView();
    const test_ui::Transitions transitions(naviframe().getEvasObj());
    test_ui::inMainLoop([&] { requestAtOnce({{"appID", doorId}, {"page", "2"}}, true); });
    settle();
    EXPECT_EQ(transitions.finished(), 1);
}

TEST_F(RequestTest, OpensThemOneAfterTheOtherOnTheWayBack) {
    writeCatalogue();
    start({std::string("appID=") + doorId});
    EXPECT_THAT(titles(), ElementsAre("Tips", "Tips 1/4", "Tips 3/4", "Tips 4/4"));
    for (const char* below : {"Tips 3/4", "Tips 1/4", "Tips"}) {
        naviframe().back();
        settle();
        EXPECT_EQ(titles().back(), below);
    }
    EXPECT_FALSE(test_ui::hasEnded());
}

TEST_F(RequestTest, ShowsNothingForAnApplicationWithoutATip) {
    writeCatalogue();
    start({"appID=com.example.cloc"});
    EXPECT_THAT(views(), IsEmpty());
    EXPECT_THAT(usage(), IsEmpty());
    EXPECT_FALSE(test_ui::hasEnded());
}

TEST_F(RequestTest, ShowsNothingForAPageBeyondTheTips) {
    writeCatalogue();
    start({std::string("appID=") + doorId, "page=4"});
    EXPECT_THAT(views(), IsEmpty());
    EXPECT_THAT(usage(), IsEmpty());
}

TEST_F(RequestTest, OpensATipOverNothingAfterOneThatShowedNothing) {
    writeCatalogue();
    start({"appID=com.example.none"});
    request({{"appID", clockId}});
    EXPECT_THAT(views(), ElementsAre("KestContentView"));
    EXPECT_THAT(titles(), ElementsAre("Tips 2/4"));
    EXPECT_THAT(usage(), ElementsAre("KT03 Clock"));
    EXPECT_THAT(kest_log::ofLevel('E', newLog()), IsEmpty());
}

TEST_F(RequestTest, ShowsNoListLaterWhereTheFirstShowedNothing) {
    writeCatalogue();
    start({"appID=com.example.none"});
    request({});
    EXPECT_THAT(views(), IsEmpty());
}

TEST_F(RequestTest, OpensNothingWithoutAWindow) {
    writeCatalogue();
    class : public App {
        bool onCreate() override { return true; }
    } windowless;
    test_ui::RunningApp running(windowless, {std::string("appID=") + doorId});
    settle();
    EXPECT_THAT(newLines(), Contains(kest_log::error(file, "__openMenu", "getWindow is NULL")).Times(1));
    EXPECT_THAT(usage(), IsEmpty());
}

TEST_F(RequestTest, OpensNothingWithoutANaviframe) {
    writeCatalogue();
    class : public App {
        bool onCreate() override {
            attachWindow(new app_assist::WWindow("Bare", ELM_WIN_BASIC));
            return true;
        }
    } bare;
    test_ui::RunningApp running(bare, {std::string("appID=") + doorId});
    settle();
    EXPECT_THAT(newLines(), Contains(kest_log::error(file, "__openMenu", "WNaviframe is NULL")).Times(1));
    EXPECT_THAT(usage(), IsEmpty());
}

/// What "page" asks for.
class RequestedPage : public RequestTest, public testing::WithParamInterface<std::pair<const char*, const char*>> {};

TEST_P(RequestedPage, CountsTheApplicationsTipsFromOne) {
    writeCatalogue();
    start({std::string("appID=") + doorId, std::string("page=") + GetParam().first});
    EXPECT_THAT(usage(), Not(IsEmpty()));
    EXPECT_EQ(usage().front(), std::string("KT03 ") + GetParam().second);
    EXPECT_THAT(newLines(), Not(Contains(missing("page"))));
}

INSTANTIATE_TEST_SUITE_P(Texts, RequestedPage,
                         testing::Values(std::pair("1", "Open"), std::pair("2", "Close"), std::pair("3", "Lock"),
                                         std::pair("", "Open"), std::pair("0", "Open"), std::pair("-7", "Open"),
                                         std::pair("door", "Open"), std::pair(" 2x", "Close"), std::pair("03", "Lock"),
                                         std::pair("-99999999999999999999", "Open")));

TEST_F(RequestTest, OpensNothingForAPageThatNoNumberHolds) {
    writeCatalogue();
    start({std::string("appID=") + doorId, "page=99999999999999999999"});
    EXPECT_THAT(views(), IsEmpty());
}
