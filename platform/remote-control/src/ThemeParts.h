#pragma once

#include "Element.h"

#include <Evas.h>

#include <map>
#include <string>
#include <vector>

namespace remote_control {

/// Knows the parts of theme groups. A themed object does not tell which parts it has, so their names are read from its
/// file; each group is read once in the life of this object.
class ThemeParts {
public:
    explicit ThemeParts(Evas* canvas) : canvas_(canvas) {}

    /// A part that has several looks.
    struct Changing {
        std::string name;
        bool holdsContent;  ///< another object stands in it
    };
    /// What a group has.
    struct Group {
        std::vector<std::string> texts;
        std::vector<std::string> swallows;  ///< parts that hold other objects
        std::vector<Changing> changing;     ///< none for the groups of the toolkit's widgets; no texts
    };

    /// The group that draws `themed`; an empty one where that cannot be told.
    const Group& groupOf(const Evas_Object* themed);
    /// Gives each text that a part of `themed` draws, and each element that stands in one, the name of that part.
    void nameParts(const Evas_Object* themed, Element& element);
    /// The text parts that a list asks for when it shows an item of that group, in the group's order.
    /// Empty when no theme has the group.
    const std::vector<std::string>& itemTexts(const std::string& group);

private:
    void read(const std::string& file, const std::string& name, Group& group) const;

    Evas* canvas_;
    std::map<std::string, Group> groups_;
    std::map<std::string, std::vector<std::string>> itemTexts_;
};

/// The text without its markup; line breaks become blanks and pictures are left out.
std::string plainText(const std::string& markup);

}  // namespace remote_control
