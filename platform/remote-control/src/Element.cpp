#include "Element.h"

#include <algorithm>
#include <tuple>

namespace remote_control {

namespace {

void collect(const Element& element, std::vector<Text>& texts) {
    texts.insert(texts.end(), element.texts.begin(), element.texts.end());
    for (const Row& row : element.rows) {
        collect(row.element, texts);
    }
    for (const Element& child : element.children) {
        collect(child, texts);
    }
}

}  // namespace

std::vector<Text> textsOf(const std::vector<Element>& elements) {
    std::vector<Text> texts;
    for (const Element& element : elements) {
        collect(element, texts);
    }
    std::stable_sort(texts.begin(), texts.end(), [](const Text& a, const Text& b) {
        return std::make_tuple(a.seen.empty(), a.place.y, a.place.x) <
               std::make_tuple(b.seen.empty(), b.place.y, b.place.x);
    });
    return texts;
}

}  // namespace remote_control
