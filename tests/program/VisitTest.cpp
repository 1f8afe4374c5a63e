#include "ProgramTest.h"

#include <chrono>
#include <functional>
#include <thread>

using test_tool::done;

namespace {

using Json = nlohmann::json;

constexpr char wallet[] = "com.ravella.wallet";
constexpr int halfALine = 35;

/// The first element in sight that `is` holds for; null when there is none.
Json findInSight(const Json& elements, const std::function<bool(const Json&)>& is) {
    for (const Json& element : elements) {
        if (element["visible"] == true && is(element)) {
            return element;
        }
        if (Json below = findInSight(element.value("children", Json::array()), is); !below.is_null()) {
            return below;
        }
    }
    return nullptr;
}

/// A person's whole visit, through kest-device alone, to a tip whose demonstration has a finger in it: a marker over
/// its first picture.
class Visit : public ProgramTest {
protected:
    void SetUp() override { start(); }

    Json inSight(const std::function<bool(const Json&)>& is) {
        return findInSight(device_.json({"tree"})["elements"], is);
    }
    /// The picture area of the page in view.
    Json area() {
        return inSight([](const Json& element) { return element.value("group", "") == "layout/multi_image"; });
    }
    /// How a part of the theme looks: its state's name.
    static std::string stateOf(const Json& element, const std::string& name) {
        for (const Json& part : element.value("parts", Json::array())) {
            if (part["part"] == name) {
                return part["state"];
            }
        }
        return "default";
    }
    bool replyIsHidden() { return stateOf(area(), "reply.clip") != "shown"; }
    bool markerShows() {
        const Json picture = inSight(
            [](const Json& element) { return element.value("group", "").rfind("layout/multi_image/", 0) == 0; });
        return stateOf(picture, "touch.clip") != "default";
    }
    /// The picture of the demonstration in view, counting from 1, and how many it has.
    std::pair<int, int> pictureInView() {
        const Json pictures = area();
        return pictures.is_null()
                   ? std::pair(0, 0)
                   : std::pair(pictures["children"][0]["page"].get<int>(), pictures["children"][0]["pages"].get<int>());
    }
    /// Whether that comes to be in less time than a demonstration takes twice.
    static bool becomes(const std::function<bool()>& condition) {
        const auto end = std::chrono::steady_clock::now() + std::chrono::seconds(15);
        while (!condition()) {
            if (std::chrono::steady_clock::now() > end) {
                return false;
            }
            std::this_thread::sleep_for(std::chrono::milliseconds(100));
        }
        return true;
    }
    /// Reads the text down to its last line, which is the link, and taps that.
    void followLink() {
        device_.must({"swipe", "360", "1200", "360", "850"});
        const Json entry = inSight([](const Json& element) { return element["type"] == "Elm_Entry"; });
        ASSERT_FALSE(entry.is_null());
        const int bottom = entry["y"].get<int>() + entry["height"].get<int>();
        const int lineBegin = entry["x"].get<int>() + halfALine;
        device_.must({"tap", std::to_string(lineBegin), std::to_string(bottom - halfALine)});
    }
    /// Turns the page with a finger: to the next one, or back.
    void turnPage(bool forth = true) {
        device_.must({"swipe", forth ? "600" : "100", "400", forth ? "100" : "600", "400"});
    }
};

}  // namespace

TEST_F(Visit, LeadsFromTheListThroughADemonstrationAndALinkBackToTheList) {
    const std::size_t tips = titles().size();
    const auto titleOf = [tips](std::size_t page) {
        return "Tips " + std::to_string(page) + "/" + std::to_string(tips);
    };
    device_.must({"swipe", "360", "1100", "360", "300"});
    device_.must({"tap", "--text", "Pay with your wrist"});
    ASSERT_EQ(titleBar(), titleOf(tips));

    EXPECT_TRUE(becomes([&] { return replyIsHidden(); }));
    const auto [first, pictures] = pictureInView();
    EXPECT_EQ(first, 1);
    EXPECT_TRUE(becomes([&] { return markerShows(); }));
    EXPECT_TRUE(becomes([&, last = pictures] { return pictureInView().first == last; }));
    EXPECT_TRUE(replyIsHidden());
    EXPECT_TRUE(becomes([&] { return !replyIsHidden(); })) << "the demonstration has no end";
    EXPECT_TRUE(becomes([&] { return pictureInView().first == 1 && !markerShows(); }));

    turnPage(false);
    EXPECT_EQ(titleBar(), titleOf(tips - 1));
    turnPage();
    EXPECT_EQ(titleBar(), titleOf(tips)) << "it is the last page";

    followLink();
    EXPECT_EQ(device_.run({"wait-for", "text=page: add", "--app", wallet}), done());
    const Json launches = device_.json({"launches"});
    ASSERT_EQ(launches.size(), 1U);
    EXPECT_EQ(launches[0]["caller"], app);
    EXPECT_EQ(launches[0]["application"], wallet);
    EXPECT_EQ(launches[0]["extras"], Json({{"page", "add"}}));
    EXPECT_EQ(launches[0]["outcome"], "started");
    device_.must({"key", "back", "--app", wallet});

    device_.must({"key", "back"});
    EXPECT_TRUE(holds("view=KestMainView"));
    EXPECT_TRUE(holds("text=Light your way home"));
}
