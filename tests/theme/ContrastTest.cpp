#include "support/TemporaryFolder.h"
#include "ui/UiTest.h"

#include <Edje.h>

#include <algorithm>
#include <cmath>
#include <cstdio>
#include <map>
#include <memory>
#include <regex>

namespace {

struct Colour {
    int red = 0;
    int green = 0;
    int blue = 0;
};
using Colours = std::map<std::string, Colour>;

Colours lightColours() {
    const std::unique_ptr<Eina_File, decltype(&eina_file_close)> file(eina_file_open(DEVICE_THEME, EINA_FALSE),
                                                                      eina_file_close);
    const std::unique_ptr<Eina_Iterator, decltype(&eina_iterator_free)> classes(
        edje_mmap_color_class_iterator_new(file.get()), eina_iterator_free);
    Colours colours;
    void* each = nullptr;
    while (eina_iterator_next(classes.get(), &each)) {
        const auto* colour = static_cast<const Edje_Color_Class*>(each);
        colours[colour->name] = {colour->r, colour->g, colour->b};
    }
    return colours;
}

Colours darkColours() {
    Colours colours;
    for (const auto& [name, light] : lightColours()) {
        const std::unique_ptr<char, decltype(&std::free)> text(
            edje_file_data_get(DEVICE_THEME, ("dark:" + name).c_str()), std::free);
        unsigned int value = 0;
        EXPECT_TRUE(text && std::sscanf(text.get(), "#%6x", &value) == 1) << name;
        colours[name] = {static_cast<int>(value >> 16), static_cast<int>(value >> 8 & 255),
                         static_cast<int>(value & 255)};
    }
    return colours;
}

/// Relative luminance and contrast as the Web Content Accessibility Guidelines define them.
double luminance(const Colour& colour) {
    const auto linear = [](int value) {
        const double part = value / 255.0;
        return part <= 0.04045 ? part / 12.92 : std::pow((part + 0.055) / 1.055, 2.4);
    };
    return 0.2126 * linear(colour.red) + 0.7152 * linear(colour.green) + 0.0722 * linear(colour.blue);
}

double contrast(const Colour& a, const Colour& b) {
    const auto [darker, lighter] = std::minmax({luminance(a), luminance(b)});
    return (lighter + 0.05) / (darker + 0.05);
}

class Contrast : public test_ui::UiTest, public testing::WithParamInterface<const char*> {
protected:
    const Colours colours_ = GetParam() == std::string("dark") ? darkColours() : lightColours();
};

TEST_P(Contrast, OfTextIsAtLeastFourAndAHalf) {
    for (const char* text : {"device/title", "device/text", "device/caption", "device/accent"}) {
        for (const char* ground : {"device/page", "device/pressed"})
            EXPECT_GE(contrast(colours_.at(text), colours_.at(ground)), 4.5) << text << " on " << ground;
    }
    for (const char* text : {"device/reading", "device/link"})
        EXPECT_GE(contrast(colours_.at(text), colours_.at("device/page")), 4.5) << text;
    EXPECT_GE(contrast(colours_.at("device/link"), colours_.at("device/link/pressed")), 4.5);
}

TEST_P(Contrast, OfMarksIsAtLeastThree) {
    for (const char* mark : {"device/focus", "device/scrollbar"})
        EXPECT_GE(contrast(colours_.at(mark), colours_.at("device/page")), 3.0) << mark;
}

/// The colours of the application's table, those of the device that it sets among them.
Colours applicationColours(const std::string& theme) {
    const std::string text = support::readFile(PROJECT "/res/table/com.ravella.kest_ChangeableColorInfo.xml");
    const std::regex row("class=\"([^\"]+)\" light=\"#([0-9A-F]{6})\" dark=\"#([0-9A-F]{6})\"");
    Colours colours;
    for (std::sregex_iterator match(text.begin(), text.end(), row), end; match != end; ++match) {
        const int value = std::stoi((*match)[theme == "dark" ? 3 : 2], nullptr, 16);
        colours[(*match)[1]] = {value >> 16, value >> 8 & 255, value & 255};
    }
    return colours;
}

class ContrastOnAPage : public test_ui::UiTest, public testing::WithParamInterface<const char*> {
protected:
    const Colours colours_ = applicationColours(GetParam());
    const Colours ofTheDevice_ = GetParam() == std::string("dark") ? darkColours() : lightColours();
};

TEST_P(ContrastOnAPage, OfTheTitleTheTextAndItsLinksIsAtLeastFourAndAHalf) {
    constexpr Colour black;
    const Colour paper = colours_.at("kest/content/info");
    EXPECT_GE(contrast(black, paper), 4.5);
    EXPECT_GE(contrast(colours_.at("device/reading"), paper), 4.5);
    EXPECT_GE(contrast(colours_.at("device/link"), paper), 4.5);
    EXPECT_GE(contrast(colours_.at("device/link"), colours_.at("device/link/pressed")), 4.5);
}

TEST_P(ContrastOnAPage, OfTheScrollbarIsAtLeastThree) {
    EXPECT_GE(contrast(ofTheDevice_.at("device/scrollbar"), colours_.at("kest/content/info")), 3.0);
}

TEST_P(ContrastOnAPage, OfTheReplyArrowIsAtLeastFourAndAHalf) {
    for (const char* ground : {"kest/reply/ground", "kest/reply/pressed"})
        EXPECT_GE(contrast(colours_.at("kest/reply/arrow"), colours_.at(ground)), 4.5) << ground;
}

TEST_P(ContrastOnAPage, OfTheReplyButtonOrTheLineAroundItIsAtLeastThreeOnAnyPicture) {
    for (const char* ground : {"kest/reply/ground", "kest/reply/pressed"}) {
        for (int grey = 0; grey < 256; ++grey) {
            const Colour picture{grey, grey, grey};
            const double disc = contrast(colours_.at(ground), picture);
            const double line = contrast(colours_.at("kest/reply/arrow"), picture);
            EXPECT_GE(std::max(disc, line), 3.0) << ground << " on " << grey;
        }
    }
}

TEST_P(ContrastOnAPage, OfThePicturesFrameIsAtLeastOneAndAHalf) {
    EXPECT_GE(contrast(colours_.at("kest/picture/frame"), colours_.at("kest/content/background")), 1.5);
    EXPECT_GE(contrast(colours_.at("kest/picture/frame"), colours_.at("kest/picture/ground")), 3.0);
}

INSTANTIATE_TEST_SUITE_P(Theme, ContrastOnAPage, testing::Values("light", "dark"),
                         [](const auto& theme) { return std::string(theme.param); });

INSTANTIATE_TEST_SUITE_P(Theme, Contrast, testing::Values("light", "dark"),
                         [](const auto& theme) { return std::string(theme.param); });

}  // namespace
