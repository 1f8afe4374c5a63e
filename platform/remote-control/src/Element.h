#pragma once

#include "Rectangle.h"

#include <Evas.h>

#include <string>
#include <vector>

namespace remote_control {

/// A text as it is drawn, or as it would be if its row came into sight.
struct Text {
    std::string part;               ///< name of the theme's part that shows it; empty when it is in none
    std::string text;               ///< without markup
    Rectangle place;                ///< where it is drawn
    Rectangle seen;                 ///< what of it is in sight
    Evas_Object* object = nullptr;  ///< what draws it; null for a row that is out of sight
};

/// A part of a theme's group that has several looks, such as a mark that comes and goes.
struct Part {
    std::string name;
    std::string state;  ///< the look's name in the theme
    Rectangle place;
    Rectangle seen;
};

/// Which page a scroller that stops at pages is at.
struct Pages {
    int current = 0;  ///< counts from 1; 0 for a scroller without pages
    int count = 0;
};

/// An item of a naviframe's stack.
struct StackItem {
    std::string title;
    std::string view;  ///< name of its content
    bool top = false;
};

struct Row;

/// What a person would point at on the screen: a widget, or a themed object within one.
struct Element {
    std::string type;   ///< the widget's type, "Edje" for a themed object that is no widget
    std::string name;   ///< for views, the name of their class
    std::string style;  ///< style of a widget
    std::string group;  ///< group of the theme that draws it
    std::string file;   ///< picture that an image shows
    std::string part;   ///< name of the theme's part that it stands in; empty when it is in none
    Rectangle place;
    Rectangle seen;
    Evas_Object* object = nullptr;
    Pages pages;
    std::vector<Text> texts;
    std::vector<Part> parts;
    std::vector<StackItem> items;
    std::vector<Row> rows;
    std::vector<Element> children;

    bool visible() const { return !seen.empty(); }
};

/// A row of a list, also one that is out of sight.
struct Row {
    int index = 0;  ///< counts from 1
    std::string style;
    Element element;  ///< what is drawn of it; out of sight, its texts only
};

/// Reads the whole screen of a window. Returns its top-level elements, the lowest first.
std::vector<Element> readScreen(Evas_Object* window);

/// All texts of the elements, rows included, from top to bottom and from left to right; those out of sight last.
std::vector<Text> textsOf(const std::vector<Element>& elements);

}  // namespace remote_control
