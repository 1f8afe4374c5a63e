#pragma once

#include "Element.h"

namespace remote_control {

class ThemeParts;

/// Whether the element is what a list draws of one of its items.
bool isRow(const Element& element);

/// Gives the element of a list one row per item, and the rows in sight the elements that draw them, which are
/// children of `element` no longer.
void readRows(Element& element, Evas_Object* list, ThemeParts& parts);

}  // namespace remote_control
