#include "TextSearch.h"

#include "device/Error.h"

#include <Evas.h>

#include <algorithm>
#include <cstdlib>
#include <functional>
#include <memory>

namespace remote_control {

namespace {

constexpr std::size_t mostTextsInMessage = 30;

std::string quoted(const std::string& text) {
    return '"' + text + '"';
}

std::vector<Text> matching(const std::vector<Text>& texts, const std::function<bool(const Text&)>& matches) {
    std::vector<Text> found;
    std::copy_if(texts.begin(), texts.end(), std::back_inserter(found), matches);
    return found;
}

bool inSight(const Text& text) {
    return !text.seen.empty();
}

std::string withoutPlace(const Text& text) {
    return quoted(text.text);
}

std::string listOf(const std::vector<Text>& texts, const std::function<std::string(const Text&)>& nameOf) {
    std::string list;
    for (std::size_t i = 0; i < std::min(texts.size(), mostTextsInMessage); ++i) {
        list += (i ? ", " : "") + nameOf(texts[i]);
    }
    if (texts.size() > mostTextsInMessage) {
        list += " and " + std::to_string(texts.size() - mostTextsInMessage) + " more";
    }
    return list.empty() ? "none" : list;
}

struct CursorFree {
    void operator()(Evas_Textblock_Cursor* cursor) const { evas_textblock_cursor_free(cursor); }
};
using Cursor = std::unique_ptr<Evas_Textblock_Cursor, CursorFree>;

struct Free {
    void operator()(char* text) const { std::free(text); }
};

struct RectanglesFree {
    void operator()(Eina_List* rectangles) const {
        void* rectangle = nullptr;
        EINA_LIST_FREE(rectangles, rectangle) {
            std::free(rectangle);
        }
    }
};

Cursor cursorAt(const Evas_Object* textblock, int position) {
    Cursor cursor(evas_object_textblock_cursor_new(textblock));
    evas_textblock_cursor_pos_set(cursor.get(), position);
    return cursor;
}

int charactersIn(const std::string& utf8) {
    return static_cast<int>(std::count_if(utf8.begin(), utf8.end(), [](char c) { return (c & 0xC0) != 0x80; }));
}

std::string plainTextOf(const Evas_Object* textblock) {
    const Cursor begin = cursorAt(textblock, 0);
    const Cursor end(evas_object_textblock_cursor_new(textblock));
    evas_textblock_cursor_paragraph_last(end.get());
    const std::unique_ptr<char, Free> whole(
        evas_textblock_cursor_range_text_get(begin.get(), end.get(), EVAS_TEXTBLOCK_TEXT_PLAIN));
    return whole ? whole.get() : "";
}

/// The lines of `wanted` within a block of text, wherever in it that stands; none when it does not stand there as it
/// is.
std::vector<Rectangle> placesWithin(const Text& block, const std::string& wanted) {
    std::vector<Rectangle> places;
    const std::string text = plainTextOf(block.object);
    for (std::size_t at = text.find(wanted); at != std::string::npos; at = text.find(wanted, at + wanted.size())) {
        const int first = charactersIn(text.substr(0, at));
        const Cursor from = cursorAt(block.object, first);
        const Cursor to = cursorAt(block.object, first + charactersIn(wanted));
        const std::unique_ptr<Eina_List, RectanglesFree> lines(
            evas_textblock_cursor_range_geometry_get(from.get(), to.get()));
        const Eina_List* node = nullptr;
        void* each = nullptr;
        EINA_LIST_FOREACH(lines.get(), node, each) {
            const auto* line = static_cast<const Evas_Textblock_Rectangle*>(each);
            places.push_back({block.place.x + line->x, block.place.y + line->y, line->w, line->h});
        }
    }
    return places;
}

bool isBlock(const Text& text) {
    return text.object && std::string(evas_object_type_get(text.object)) == "textblock";
}

}  // namespace

Text findText(const std::vector<Element>& screen, const std::string& wanted) {
    const std::vector<Text> all = textsOf(screen);
    std::vector<Text> found = matching(all, [&](const Text& text) { return text.text == wanted; });
    if (found.empty()) {
        found = matching(all, [&](const Text& text) { return text.text.find(wanted) != std::string::npos; });
    }
    const std::vector<Text> seen = matching(found, [&](const Text& text) { return !touchPlace(text, wanted).empty(); });
    if (seen.size() == 1) {
        return seen.front();
    }
    if (seen.size() > 1) {
        const auto withPlace = [&](const Text& text) {
            const Rectangle place = touchPlace(text, wanted);
            return quoted(text.text) + " at " + std::to_string(place.centreX()) + "," + std::to_string(place.centreY());
        };
        throw device::Error("the text " + quoted(wanted) + " is on the screen " + std::to_string(seen.size()) +
                            " times: " + listOf(seen, withPlace) + "; give more of it, or tap one of these places");
    }
    const std::string there = listOf(matching(all, inSight), withoutPlace);
    if (!found.empty()) {
        throw device::Error("the text " + quoted(wanted) +
                            " is out of sight; swipe to bring it in; in sight are: " + there);
    }
    throw device::Error("no text " + quoted(wanted) + " on the screen; in sight are: " + there);
}

Rectangle touchPlace(const Text& text, const std::string& wanted) {
    const std::vector<Rectangle> within =
        !wanted.empty() && wanted != text.text && isBlock(text) ? placesWithin(text, wanted) : std::vector<Rectangle>{};
    if (within.empty()) {
        return text.seen;
    }
    for (const Rectangle& place : within) {
        if (const Rectangle seen = place.cutTo(text.seen); !seen.empty()) {
            return seen;
        }
    }
    return {};
}

bool showsText(const std::vector<Element>& screen, const std::string& wanted) {
    const std::vector<Text> all = textsOf(screen);
    return std::any_of(all.begin(), all.end(), [&](const Text& text) {
        return text.text.find(wanted) != std::string::npos && !touchPlace(text, wanted).empty();
    });
}

}  // namespace remote_control
