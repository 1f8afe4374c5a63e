#pragma once

#include <Elementary.h>

namespace test_ui {

/// Counts the transitions of a naviframe, which has to outlive it, that come to their end.
class Transitions {
public:
    explicit Transitions(Evas_Object* naviframe) : naviframe_(naviframe) {
        evas_object_smart_callback_add(naviframe_, event, count, this);
    }
    ~Transitions() { evas_object_smart_callback_del_full(naviframe_, event, count, this); }
    Transitions(const Transitions&) = delete;
    Transitions& operator=(const Transitions&) = delete;

    int finished() const { return finished_; }

private:
    static constexpr char event[] = "transition,finished";
    static void count(void* self, Evas_Object*, void*) { ++static_cast<Transitions*>(self)->finished_; }

    Evas_Object* naviframe_;
    int finished_ = 0;
};

}  // namespace test_ui
