#include "ui/UiTest.h"

#include <Edje.h>

#include <algorithm>
#include <cmath>
#include <cstdio>
#include <map>
#include <memory>

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
}

TEST_P(Contrast, OfMarksIsAtLeastThree) {
    for (const char* mark : {"device/focus", "device/scrollbar"})
        EXPECT_GE(contrast(colours_.at(mark), colours_.at("device/page")), 3.0) << mark;
}

INSTANTIATE_TEST_SUITE_P(Theme, Contrast, testing::Values("light", "dark"),
                         [](const auto& theme) { return std::string(theme.param); });

}  // namespace
