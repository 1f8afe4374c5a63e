#pragma once

#include <filesystem>
#include <vector>

namespace test_ui {

struct Rect;

/// What a screen showed at one moment.
class Picture {
public:
    /// `pixels` are `width` times `height` of 0xAARRGGBB; copied.
    Picture(int width, int height, const unsigned int* pixels);

    int width() const { return width_; }
    int height() const { return height_; }
    /// 0xRRGGBB; 0 outside the picture.
    unsigned int pixel(int x, int y) const;
    /// How many pixels within `area` have that colour (0xRRGGBB).
    int count(unsigned int colour, const Rect& area) const;
    /// How many different colours there are within `area`: 1 where nothing is drawn.
    int colours(const Rect& area) const;
    /// Writes it as PNG; false when that failed.
    bool save(const std::filesystem::path& file) const;

    bool operator==(const Picture&) const = default;

private:
    int width_;
    int height_;
    std::vector<unsigned int> pixels_;
};

}  // namespace test_ui
