#pragma once

#include "Rules.h"

#include <filesystem>
#include <map>
#include <optional>
#include <string>
#include <vector>

/// The pictures of the tips' pages, and what a page expects of them.
namespace catalogue {

/// The pictures that belong to one tip by their names.
struct Pictures {
    using Files = std::map<int, std::filesystem::path>;

    Files shown;           ///< <tip>_01.png and on
    Files markers;         ///< <tip>_01_touch.png: where the finger goes in that picture
    Files russian;         ///< <tip>_russia_01.png: in its place where the language is Russian
    Files russianMarkers;  ///< no page looks for one
};

Pictures picturesOf(const Tip& tip);

/// A tip's picture is the first of a sequence without a gap, which the page has room for; markers and Russian variants
/// belong to a picture of it and are looked for; each is a PNG of the size and border that the page gives it.
Problems picturesFitThePage(const Tip& tip);

/// Every file among the pictures belongs to a tip that shows pictures.
Problems picturesBelongToTips(const std::vector<Tip>& tips);

}  // namespace catalogue
