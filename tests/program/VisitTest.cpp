#include "ProgramTest.h"

#include <algorithm>
#include <chrono>
#include <functional>
#include <thread>

using test_tool::done;

namespace {

using Json = nlohmann::json;

constexpr char wallet[] = "com.ravella.wallet";
constexpr int halfALine = 35;
constexpr int replyFromCorner = 84;

std::string groupOf(const Json& element) {
    return element.value("group", "");
}

bool isPictureArea(const Json& element) {
    return groupOf(element) == "layout/multi_image";
}

/// How a part of the theme looks: its state's name.
std::string stateOf(const Json& element, const std::string& name) {
    for (const Json& part : element.value("parts", Json::array())) {
        if (part["part"] == name) {
            return part["state"];
        }
    }
    return "default";
}

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

    /// What shows of a demonstration, its pictures counting from 1.
    struct Moment {
        int picture = 0;
        int pictures = 0;
        bool hasMarker = false;
        bool hasReply = false;
    };
    Moment look() {
        const Json elements = device_.json({"tree"})["elements"];
        const Json area = findInSight(elements, isPictureArea);
        if (area.is_null()) {
            return {};
        }
        const Json picture = findInSight(
            elements, [](const Json& element) { return groupOf(element).rfind("layout/multi_image/", 0) == 0; });
        return {area["children"][0]["page"], area["children"][0]["pages"], stateOf(picture, "touch.clip") != "default",
                stateOf(area, "reply.clip") == "shown"};
    }
    /// Looks on until each of these was there. What a slow machine does not see of a demonstration is played again.
    bool shows(std::vector<std::function<bool(const Moment&)>> moments) {
        return becomes([&] {
            const Moment now = look();
            std::erase_if(moments, [&](const auto& is) { return is(now); });
            if (!moments.empty() && now.hasReply) {
                reply();
            }
            return moments.empty();
        });
    }
    /// Of the usage records, in their order.
    std::vector<std::string> recordedFeatures() {
        std::vector<std::string> features;
        for (const Json& record : device_.json({"usage"})) {
            features.push_back(record["values"]["feature"]);
        }
        return features;
    }
    /// Taps the button in the picture area's corner.
    void reply() {
        const Json area = inSight(isPictureArea);
        ASSERT_FALSE(area.is_null());
        device_.must({"tap", std::to_string(area["x"].get<int>() + area["width"].get<int>() - replyFromCorner),
                      std::to_string(area["y"].get<int>() + area["height"].get<int>() - replyFromCorner)});
    }
    /// Whether that comes to be in less time than several demonstrations take.
    static bool becomes(const std::function<bool()>& condition) {
        const auto end = std::chrono::steady_clock::now() + std::chrono::seconds(60);
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
    const std::vector<std::string> tips = titles();
    const auto tip = std::ranges::find(tips, "Pay with your wrist");
    ASSERT_NE(tip, tips.end());
    const auto page = tip - tips.begin() + 1;
    const auto titleOf = [&tips](std::ptrdiff_t of) {
        return "Tips " + std::to_string(of) + "/" + std::to_string(tips.size());
    };
    device_.must({"swipe", "360", "1100", "360", "300"});
    device_.must({"tap", "--text", *tip});
    ASSERT_EQ(titleBar(), titleOf(page));

    EXPECT_TRUE(
        shows({[](const Moment& now) { return now.picture == 1 && !now.hasReply; },
               [](const Moment& now) { return now.hasMarker && !now.hasReply; },
               [](const Moment& now) { return now.picture > 1 && now.picture == now.pictures && !now.hasReply; }}));
    const auto rests = [&] {
        const Moment now = look();
        return now.hasReply && now.picture == 1 && !now.hasMarker;
    };
    EXPECT_TRUE(becomes(rests)) << "the demonstration has no end";
    reply();
    EXPECT_TRUE(shows({[](const Moment& now) { return now.picture > 1; }})) << "it does not play again";
    EXPECT_TRUE(becomes(rests));

    turnPage(false);
    EXPECT_EQ(titleBar(), titleOf(page - 1));
    turnPage();
    EXPECT_EQ(titleBar(), titleOf(page));

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

    const std::vector<std::string> features = recordedFeatures();
    EXPECT_EQ(features.front(), "KT01");
    EXPECT_THAT(std::vector<std::string>(features.begin() + 1, features.end()),
                testing::AllOf(testing::Not(testing::IsEmpty()), testing::Each("KT02")));
}
