#pragma once

#include "ui/Screen.h"

#include <Elementary.h>

#include <string>
#include <vector>

namespace test_ui {

/// The widgets of that type ("Elm_Genlist", "Elm_Button") below `root`, `root` included, that can be seen.
std::vector<Evas_Object*> widgets(Evas_Object* root, const std::string& type);
/// The first of them; null when there is none.
Evas_Object* widget(Evas_Object* root, const std::string& type);

/// The text in a part of a widget as the widget gives it: labels and entries give markup.
std::string text(const Evas_Object* widget, const char* part = nullptr);
/// The same for a part of a list's row or a naviframe's item.
std::string itemText(const Elm_Object_Item* item, const char* part = nullptr);

/// The text of a label or an entry as it is shown, without markup.
std::string plainText(const Evas_Object* widget, const char* part = nullptr);

/// All rows of a list, also those out of sight.
std::vector<Elm_Object_Item*> rows(const Evas_Object* genlist);
/// Where a row lies; empty when it was never in sight.
Rect rowGeometry(Elm_Object_Item* row);

/// Where a link of an entry lies, by its href; empty when there is none.
Rect link(const Evas_Object* entry, const std::string& href);

}  // namespace test_ui
