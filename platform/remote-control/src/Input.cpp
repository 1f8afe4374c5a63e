#include "Input.h"

#include "Rectangle.h"
#include "device/Error.h"

#include <Ecore_Evas.h>

#include <algorithm>
#include <array>
#include <cctype>
#include <cmath>
#include <string_view>

namespace remote_control::input {

namespace {

constexpr double tapSeconds = 0.05;
constexpr double focusSeconds = 0.1;
constexpr double moveSeconds = 0.015;
constexpr double leastSwipeSeconds = 0.01;
constexpr double mostSwipeSeconds = 10;

unsigned int now() {
    return static_cast<unsigned int>(ecore_loop_time_get() * 1000.0);
}

void requireInside(const Evas* canvas, int x, int y) {
    Rectangle area;
    evas_output_size_get(canvas, &area.width, &area.height);
    if (!area.contains(x, y)) {
        throw device::Error("the place " + std::to_string(x) + "," + std::to_string(y) +
                            " is outside the screen, which is " + std::to_string(area.width) + "x" +
                            std::to_string(area.height));
    }
}

void press(Evas* canvas, int x, int y) {
    evas_event_feed_mouse_in(canvas, now(), nullptr);
    evas_event_feed_mouse_move(canvas, x, y, now(), nullptr);
    evas_event_feed_mouse_down(canvas, 1, EVAS_BUTTON_NONE, now(), nullptr);
}

void release(Evas* canvas) {
    evas_event_feed_mouse_up(canvas, 1, EVAS_BUTTON_NONE, now(), nullptr);
}

constexpr std::array namedKeys{"Up",     "Down",   "Left", "Right", "Return", "KP_Enter",  "space",    "Tab",
                               "Escape", "Delete", "Home", "End",   "Prior",  "BackSpace", "XF86Back", "Next"};

std::string keyCalled(const std::string& name) {
    if (name == "back") {
        return "XF86Back";
    }
    const bool letter = name.size() == 1 && std::isalnum(static_cast<unsigned char>(name[0]));
    if (!letter && std::find(namedKeys.begin(), namedKeys.end(), std::string_view(name)) == namedKeys.end()) {
        std::string known;
        for (const char* key : namedKeys) {
            known += std::string(key) + ", ";
        }
        throw device::Error("unknown key \"" + name + "\"; there are " + known + "back, letters and digits");
    }
    return name;
}

}  // namespace

std::vector<Playback::Step> tap(Evas* canvas, int x, int y) {
    requireInside(canvas, x, y);
    return {{0, [=] { press(canvas, x, y); }}, {tapSeconds, [=] { release(canvas); }}};
}

std::vector<Playback::Step> swipe(Evas* canvas, int fromX, int fromY, int toX, int toY, double seconds) {
    requireInside(canvas, fromX, fromY);
    requireInside(canvas, toX, toY);
    if (!(seconds >= leastSwipeSeconds && seconds <= mostSwipeSeconds)) {
        throw device::Error("a swipe takes from 0.01 to 10 seconds");
    }
    const int moves = std::max(2, static_cast<int>(std::lround(seconds / moveSeconds)));
    std::vector<Playback::Step> steps{{0, [=] { press(canvas, fromX, fromY); }}};
    for (int i = 1; i <= moves; ++i) {
        const int x = fromX + (toX - fromX) * i / moves;
        const int y = fromY + (toY - fromY) * i / moves;
        steps.push_back({seconds / moves, [=] { evas_event_feed_mouse_move(canvas, x, y, now(), nullptr); }});
    }
    steps.push_back({0, [=] { release(canvas); }});
    return steps;
}

std::vector<Playback::Step> key(Evas* canvas, const std::string& name) {
    const std::string symbol = keyCalled(name);
    std::vector<Playback::Step> steps;
    Ecore_Evas* frame = ecore_evas_ecore_evas_get(canvas);
    if (frame && std::string_view(ecore_evas_engine_name_get(frame)).starts_with("buffer")) {
        // Without a display nothing tells the toolkit that its window has the keyboard, and it drops keys.
        steps.push_back({0, [=] { ecore_evas_focus_set(frame, EINA_FALSE); }});
        steps.push_back({focusSeconds, [=] { ecore_evas_focus_set(frame, EINA_TRUE); }});
    }
    steps.push_back({focusSeconds, [=] {
                         const char* text = symbol.size() == 1 ? symbol.c_str() : nullptr;
                         evas_event_feed_key_down(canvas, symbol.c_str(), symbol.c_str(), text, nullptr, now(),
                                                  nullptr);
                     }});
    steps.push_back(
        {tapSeconds,
         [=] { evas_event_feed_key_up(canvas, symbol.c_str(), symbol.c_str(), nullptr, nullptr, now(), nullptr); }});
    return steps;
}

}  // namespace remote_control::input
