#pragma once

#include "Pages.h"

#include <Elementary.h>

namespace bench {

/// The widgets of one page, made with plain EFL: the pictures above the title and the text.
Evas_Object* makeBarePage(Evas_Object* parent, const Page& page);

/// A widget in a box of at least that size; widgets overwrite what they were told to have at least.
Evas_Object* makeSized(Evas_Object* parent, Evas_Object* content, int width, int height);

}  // namespace bench
