#pragma once

#include <Evas.h>

#include <functional>
#include <vector>

namespace remote_control {

/// Whether the object is a widget; null is none.
bool isWidget(const Evas_Object* object);
/// The objects that the object is made of, the lowest first.
std::vector<Evas_Object*> membersOf(Evas_Object* object);
/// The objects of the canvas that are part of no other, the lowest first.
std::vector<Evas_Object*> topObjects(Evas* canvas);
/// Visits every widget of the canvas, each before those within it.
void visitWidgets(Evas* canvas, const std::function<void(Evas_Object* widget)>& visit);

}  // namespace remote_control
