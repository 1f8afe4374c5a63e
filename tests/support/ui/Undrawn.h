#pragma once

#include <Elementary.h>

namespace test_ui {

/// A window whose frames come and go without being drawn, which would take most of their time. A picture that is taken
/// of it shows it as it is.
class Undrawn {
public:
    explicit Undrawn(Evas_Object* window);
    ~Undrawn();
    Undrawn(const Undrawn&) = delete;
    Undrawn& operator=(const Undrawn&) = delete;

    /// How often the main loop has found something to do.
    int turns() const { return turns_; }

private:
    static Eina_Bool beforeIdle(void* self);
    static void windowGone(void* self, Evas* canvas, Evas_Object* window, void* info);

    Evas_Object* window_;
    Ecore_Idle_Enterer* idleEnterer_;
    int turns_ = 0;
};

}  // namespace test_ui
