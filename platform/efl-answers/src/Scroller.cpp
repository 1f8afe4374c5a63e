#include "Original.h"

#include <Elementary.h>

/// Where reading begins at the right, EFL notes the shown page's place from the wrong side. It goes there when the
/// contents get another size: another page would come into view. Showing the place that is shown notes it rightly.
/// Before anything was laid out there is no place to note, so that comes first.
extern "C" void elm_scroller_page_show(Evas_Object* scroller, int column, int row) {
    static const auto show = efl_answers::original<void(Evas_Object*, int, int)>("elm_scroller_page_show");
    if (!show)
        return;
    const bool mirrored = elm_object_mirrored_get(scroller);
    if (mirrored)
        evas_smart_objects_calculate(evas_object_evas_get(scroller));
    show(scroller, column, row);
    if (!mirrored)
        return;
    int x = 0, y = 0, width = 0, height = 0;
    elm_scroller_region_get(scroller, &x, &y, &width, &height);
    elm_scroller_region_show(scroller, x, y, width, height);
}
