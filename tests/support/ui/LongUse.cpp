// Telling a group of objects from a single one takes a call that EFL still marks as beta.
#define EFL_BETA_API_SUPPORT

#include "ui/LongUse.h"

#include "ui/Clock.h"
#include "ui/Screen.h"

#include <Eo.h>
#include <cstdlib>
#include <malloc.h>
#include <string>

namespace {

int objectsInside(const Evas_Object* object) {
    if (!efl_isa(object, EFL_CANVAS_GROUP_CLASS))
        return 0;
    int count = 0;
    Eina_List* members = evas_object_smart_members_get(object);
    void* each = nullptr;
    EINA_LIST_FREE(members, each)
    count += 1 + objectsInside(static_cast<Evas_Object*>(each));
    return count;
}

}  // namespace

test_ui::LongUse::LongUse(Evas_Object* window) : canvas_(evas_object_evas_get(window)), undrawn_(window) {}

int test_ui::LongUse::objects() const {
    int count = 0;
    for (auto* each = evas_object_bottom_get(canvas_); each; each = evas_object_above_get(each))
        count += 1 + objectsInside(each);
    return count;
}

int test_ui::LongUse::turnsInASecond() {
    const int before = undrawn_.turns();
    runFor(1.0);
    return undrawn_.turns() - before;
}

std::size_t test_ui::LongUse::memory() {
    return mallinfo2().uordblks;
}

int test_ui::timesOf(int shortRun, int longRun) {
    const char* asked = std::getenv("KEST_SOAK");
    return asked && std::string(asked) == "full" ? longRun : shortRun;
}

void test_ui::swipeAtRandom(Screen& screen, std::mt19937& random) {
    const auto pick = [&random](int least, int most) {
        return std::uniform_int_distribution<int>(least, most)(random);
    };
    const int from = pick(50, 670), to = pick(50, 670), steps = pick(1, 5);
    screen.press({from, pick(200, 1200)});
    for (int step = 1; step <= steps; ++step) {
        runFor(0.001 * pick(5, 30));
        screen.moveTo({from + (to - from) * step / steps, pick(200, 1200)});
    }
    screen.lift();
}
