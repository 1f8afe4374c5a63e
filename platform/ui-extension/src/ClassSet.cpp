#include "ClassSet.h"

#include <Edje.h>

namespace uxt {
namespace {

// What a class leaves alone of a part's outline and shadow: their colours are multiplied with the class's.
constexpr Colour unchanged{255, 255, 255, 255};

/// Calls `remove` with every name of `before` that `after` lacks.
template <typename Map, typename Function>
void forEachMissing(const Map& before, const Map& after, Function&& remove) {
    for (const auto& [name, value] : before) {
        if (!after.contains(name))
            remove(name.c_str());
    }
}

}  // namespace

void applyToProcess(const ClassSet& before, const ClassSet& after) {
    forEachMissing(before.colours, after.colours, edje_color_class_del);
    forEachMissing(before.fonts, after.fonts, edje_text_class_del);
    for (const auto& [name, colour] : after.colours)
        edje_color_class_set(name.c_str(), colour.red, colour.green, colour.blue, colour.alpha, unchanged.red,
                             unchanged.green, unchanged.blue, unchanged.alpha, unchanged.red, unchanged.green,
                             unchanged.blue, unchanged.alpha);
    for (const auto& [name, font] : after.fonts)
        edje_text_class_set(name.c_str(), font.name.c_str(), font.size);
}

void applyToLayout(Evas_Object* layout, const ClassSet& before, const ClassSet& after) {
    forEachMissing(before.colours, after.colours,
                   [layout](const char* name) { edje_object_color_class_del(layout, name); });
    forEachMissing(before.fonts, after.fonts, [layout](const char* name) { edje_object_text_class_del(layout, name); });
    for (const auto& [name, colour] : after.colours)
        edje_object_color_class_set(layout, name.c_str(), colour.red, colour.green, colour.blue, colour.alpha,
                                    unchanged.red, unchanged.green, unchanged.blue, unchanged.alpha, unchanged.red,
                                    unchanged.green, unchanged.blue, unchanged.alpha);
    for (const auto& [name, font] : after.fonts)
        edje_object_text_class_set(layout, name.c_str(), font.name.c_str(), font.size);
}

}  // namespace uxt
