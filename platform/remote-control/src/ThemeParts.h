#pragma once

#include "Element.h"

#include <Evas.h>

#include <map>
#include <string>
#include <vector>

namespace remote_control {

/// Knows the names of the text parts of theme groups. A themed object does not tell which parts it has, so the
/// names are read from its file; each group is read once in the life of this object.
class ThemeParts {
public:
    explicit ThemeParts(Evas* canvas) : canvas_(canvas) {}

    /// Gives each text that a part of `themed` draws the name of that part.
    void nameParts(const Evas_Object* themed, std::vector<Text>& texts);
    /// The text parts that a list asks for when it shows an item of that group, in the group's order.
    /// Empty when no theme has the group.
    const std::vector<std::string>& itemTexts(const std::string& group);

private:
    const std::vector<std::string>& textParts(const std::string& file, const std::string& group);

    Evas* canvas_;
    std::map<std::string, std::vector<std::string>> textParts_;
    std::map<std::string, std::vector<std::string>> itemTexts_;
};

/// The text without its markup; line breaks become blanks and pictures are left out.
std::string plainText(const std::string& markup);

}  // namespace remote_control
