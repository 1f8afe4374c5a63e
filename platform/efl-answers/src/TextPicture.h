#pragma once

#include <Elementary.h>

namespace efl_answers {

/// The picture of an `<item href=file://opt/usr/...>` inside a text, for a part of an object on `canvas`. What is
/// behind "file:/" is the picture's path; "file://opt" is how that is written without the slash that begins it, and the
/// toolkit would look for it below the current folder.
/// Null for another href. A picture that cannot be read is an empty one, so that its space stays, and one error line in
/// the log. Nothing but a regular file is opened: a pipe would wait for ever.
Evas_Object* textPicture(Evas* canvas, const char* href) noexcept;
/// What shows nothing in a picture's place.
Evas_Object* emptyPicture(Evas* canvas) noexcept;

}  // namespace efl_answers
