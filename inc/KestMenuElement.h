#pragma once

#include "KestContentInfo.h"

#include <libxml/tree.h>

#include <string>

/// A "menu" element of the main menu file. Static; holds no state.
class KestMenuElement {
public:
    /// A fresh record with what the element says: path, application, and whether the tip is offered in the region.
    static KestContentInfo read(const xmlNode* menu);
};
