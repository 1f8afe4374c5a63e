#include "Calls.h"
#include "ChangesTest.h"
#include "StormModel.h"

#include "ui/LongUse.h"

#include <algorithm>
#include <iostream>
#include <random>

namespace {

constexpr unsigned int seed = 20150407;

const std::string alarmApp = "com.example.alarm";
const std::string weatherApp = "com.example.weather";
const std::string musicApp = "com.example.music";

}  // namespace

/// Everything that can happen, in any order and at any moment, also within transitions. Begins with two pagers that a
/// request opened, and the list beneath.
class Storm : public ChangesTest {
protected:
    Storm() { std::cout << "seed " << seed << std::endl; }

    int pick(int least, int most) { return std::uniform_int_distribution<int>(least, most)(random_); }
    template <class Value>
    Value pickOf(const std::vector<Value>& values) {
        return values[static_cast<std::size_t>(pick(0, static_cast<int>(values.size()) - 1))];
    }

    void expectRecords(const std::vector<std::string>& records) {
        due_.insert(due_.end(), records.begin(), records.end());
    }

    /// A number as text, and what it comes to as a page.
    struct Page {
        std::string text;
        long number;
    };
    void requestSomething();
    /// Now and then a request has the time to be shown: then it is its last tip that shows.
    void expectToShow(const std::string& app, long page);
    void changeSomething();
    void changePackages();
    void touchSomething();
    void goBack();
    void waitAWhile();

    /// What rows and pages heard is due a record, and a row without a tip an error line.
    void hear();
    void expectWhatIsDue(int time);
    void endTheStorm();

    StormModel model_;
    std::mt19937 random_{seed};
    std::string theme_ = "light";
    std::vector<std::string> due_;
    std::vector<std::string> errors_;
    std::vector<std::string> dueErrors_;
};

void Storm::requestSomething() {
    static const std::vector<Page> pages = {{"", 1},   {"1", 1},   {"2", 2},    {"3", 3},
                                            {"0", 0},  {"-1", -1}, {" 2x", 2},  {"99999999999999999999", 99},
                                            {"x2", 0}, {"0x2", 0}, {"\xff", 0}, {"-99999999999999999999", -99}};
    static const std::vector<std::string> apps = {alarmApp,   alarmApp, alarmApp,       weatherApp,
                                                  weatherApp, musicApp, "com.example.", "com.ravella.kest"};
    switch (pick(0, 5)) {
    case 0:
        request({});
        break;
    case 1:
        request({{"LaunchingType", pickOf<std::string>({"", "addnoti", "addNoti ", "ADDNOTI", "add"})}});
        break;
    case 2:
        request({{"appID", pickOf<std::string>({"", "com.example.nobody", "\xff\xfe", "Alarm"})}, {"page", "1"}});
        break;
    default: {
        const std::string app = pickOf(apps);
        const Page page = pickOf(pages);
        expectRecords(model_.requested(app, page.number));
        request({{"appID", app}, {"page", page.text}});
        if (pick(0, 3) == 0)
            expectToShow(app, page.number);
    }
    }
}

void Storm::expectToShow(const std::string& app, long page) {
    const std::string name = model_.opened(app, page);
    if (name.empty() || !model_.hasTexts(name))
        return;
    test_ui::runFor(2);
    EXPECT_EQ(top(), pageOf(name, model_.catalogue(), model_.language()));
}

void Storm::changeSomething() {
    switch (pick(0, 4)) {
    case 0:
        model_.setLanguage(model_.language() == Language::English ? Language::Korean : Language::English);
        setLanguage(model_.language());
        model_.load(true);
        break;
    case 1:
        theme_ = theme_ == "dark" ? "light" : "dark";
        setTheme(theme_);
        model_.load(false);
        break;
    case 2: {
        const std::string country = pickOf<std::string>({"IN", "DE"});
        setCountry(country);
        model_.setCountry(country);
        break;
    }
    case 3: {
        const Names menus = pickOf<Names>({tips::atFirst(), tips::with(tips::atFirst(), "Torch"),
                                           tips::without(tips::without(tips::atFirst(), "Clock"), "Notes")});
        writeMenuFile(menus);
        model_.setMenuFile(menus);
        break;
    }
    default:
        changePackages();
    }
}

void Storm::changePackages() {
    const std::string app = pickOf<std::string>({weatherApp, musicApp});
    switch (pick(0, 3)) {
    case 0:
        failToInstall("com.example.new");
        return;
    case 1:
        update("com.example.other");
        return;
    default:
        model_.isInstalled(app) ? uninstall(app) : install(app);
        model_.setInstalled(app, !model_.isInstalled(app));
    }
    model_.load(true);
}

void Storm::touchSomething() {
    switch (pick(0, 3)) {
    case 0:
        screen().tap({pick(20, 700), pick(120, 1270)}, 0.001 * pick(1, 120));
        break;
    case 1:
        test_ui::swipeAtRandom(screen(), random_);
        break;
    case 2:
        if (pictureInView() >= 0)
            reply();
        break;
    default:
        if (topView() == "KestMainView" && list())
            tapRow(static_cast<std::size_t>(pick(0, static_cast<int>(test_ui::rows(list()).size()) - 2)));
    }
}

void Storm::goBack() {
    // From the list it would lead out of the application.
    if (levels() > 1 && topView() == "KestContentView")
        back();
}

void Storm::waitAWhile() {
    static const std::vector<double> whiles = {0, 0, 0.001, 0.02, 0.05, 0.1, 0.2, 0.4, 0.6, 1.2};
    test_ui::runFor(pickOf(whiles));
}

void Storm::hear() {
    const std::string tapped = "KestMainView.cpp: __selectItemCb > selected index:";
    for (const calls::Line& line : calls::newLines()) {
        if (line.level == 'E')
            errors_.push_back(line.message);
        if (!line.message.starts_with(tapped))
            continue;
        const std::string index = line.message.substr(tapped.size());
        const std::string record = model_.chosen(std::stoi(index));
        if (record.empty())
            dueErrors_.push_back("KestMainView.cpp: __selectItemCb > no record for index:" + index);
        else
            due_.push_back(record);
    }
    for (int press = calls::newPresses(); press > 0; --press)
        due_.emplace_back("KT02");
}

void Storm::expectWhatIsDue(int time) {
    std::vector<std::string> records = newRecords();
    std::sort(records.begin(), records.end());
    std::sort(due_.begin(), due_.end());
    ASSERT_EQ(records, due_) << "after action " << time;
    due_.clear();
    ASSERT_EQ(errors_, dueErrors_) << "after action " << time;
}

void Storm::endTheStorm() {
    setCountry("DE");
    writeMenuFile(tips::atFirst());
    if (model_.isInstalled(weatherApp))
        uninstall(weatherApp);
    if (model_.isInstalled(musicApp))
        uninstall(musicApp);
    setTheme("dark");
    setLanguage(Language::Korean);
    install(weatherApp);
    newRecords();
    request({{"appID", alarmApp}, {"page", "2"}});
    test_ui::runFor(2);
    EXPECT_THAT(newRecords(), testing::ElementsAre("KT03 다시 알림"));
}

TEST_F(Storm, EndsWithWhatWasAskedForLast) {
    begin({"appID=" + alarmApp});
    expectRecords(model_.requested(alarmApp, 1));
    const int asked = test_ui::timesOf(1000, 20000);
    for (int time = 0, count = 0; count < asked; ++time) {
        const int what = pick(0, 8);
        if (what < 5)
            ++count;
        if (what < 3)
            requestSomething();
        else if (what < 5)
            changeSomething();
        else if (what < 8)
            touchSomething();
        else
            goBack();
        waitAWhile();
        ASSERT_FALSE(test_ui::hasEnded()) << "after action " << time;
        hear();
        ASSERT_FALSE(HasFailure()) << "after action " << time;
        if (time % 25 == 24) {
            ASSERT_NO_FATAL_FAILURE(expectWhatIsDue(time));
        }
    }
    endTheStorm();
    const Names names = tips::with(tips::without(tips::atFirst(), "Music"), "Weather");
    EXPECT_EQ(levels(), 2U);
    EXPECT_EQ(top(), pageOf("Snooze", names, Language::Korean));
    EXPECT_EQ(ground(10), 0x0E1116U);
    back();
    test_ui::runFor(1);
    EXPECT_EQ(topView(), "KestMainView");
    EXPECT_EQ(rows(), rowsOf(names, Language::Korean));
}
