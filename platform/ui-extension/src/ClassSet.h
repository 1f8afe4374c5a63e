#pragma once

#include "Tables.h"

#include <Evas.h>

namespace uxt {

/// Colours and fonts that hold for the same layouts.
struct ClassSet {
    Colours colours;
    Fonts fonts;

    bool isEmpty() const { return colours.empty() && fonts.empty(); }
};

/// Gives all layouts of the process these colours and fonts. What `before` had and `after` lacks goes back to what
/// the theme files say.
void applyToProcess(const ClassSet& before, const ClassSet& after);

/// The same for one layout (an Edje object) and the groups inside it; it wins over what the process has.
void applyToLayout(Evas_Object* layout, const ClassSet& before, const ClassSet& after);

}  // namespace uxt
