#pragma once

#include <algorithm>

namespace remote_control {

/// A rectangle of the window, in pixels.
struct Rectangle {
    int x = 0;
    int y = 0;
    int width = 0;
    int height = 0;

    bool empty() const { return width <= 0 || height <= 0; }
    bool contains(int px, int py) const { return px >= x && py >= y && px < x + width && py < y + height; }
    int centreX() const { return x + width / 2; }
    int centreY() const { return y + height / 2; }

    Rectangle cutTo(const Rectangle& other) const {
        const int left = std::max(x, other.x);
        const int top = std::max(y, other.y);
        const int right = std::min(x + width, other.x + other.width);
        const int bottom = std::min(y + height, other.y + other.height);
        return right > left && bottom > top ? Rectangle{left, top, right - left, bottom - top} : Rectangle{};
    }

    bool operator==(const Rectangle&) const = default;
};

}  // namespace remote_control
