#include "Original.h"

#include <Elementary.h>

#include <memory>

namespace {

constexpr char key[] = "efl_answers::LayingOut";

/// Lays a list out anew, soon, and keeps the place that it shows.
class LayingOut {
public:
    explicit LayingOut(Evas_Object* genlist) : genlist_(genlist) {
        elm_scroller_region_get(genlist, nullptr, &y_, nullptr, nullptr);
        evas_object_data_set(genlist, key, this);
    }
    ~LayingOut() {
        evas_object_data_del(genlist_, key);
        ecore_job_del(job_);
    }
    LayingOut(const LayingOut&) = delete;
    LayingOut& operator=(const LayingOut&) = delete;

private:
    static void run(void* self) {
        const std::unique_ptr<LayingOut> last(static_cast<LayingOut*>(self));
        last->job_ = nullptr;
        last->layOut();
    }
    void layOut() const {
        int width = 0, height = 0;
        evas_object_geometry_get(genlist_, nullptr, nullptr, &width, &height);
        evas_object_resize(genlist_, width + 1, height);
        evas_object_resize(genlist_, width, height);
        evas_smart_objects_calculate(evas_object_evas_get(genlist_));
        elm_scroller_region_show(genlist_, 0, y_, width, height);
    }

    Evas_Object* genlist_;
    int y_ = 0;
    Ecore_Job* job_ = ecore_job_add(run, this);
};

// Not at once: the list has yet to forget its rows.
void themed(void*, Evas_Object* genlist, void*) {
    if (!evas_object_data_get(genlist, key))
        static_cast<void>(new LayingOut(genlist));
}

void listGoes(void*, Evas*, Evas_Object* genlist, void*) {
    delete static_cast<LayingOut*>(evas_object_data_get(genlist, key));
}

}  // namespace

/// When its theme is applied anew, as when widgets are mirrored, a list whose rows are as wide as itself forgets their
/// sizes and waits for another width before it takes them again: it stays empty.
extern "C" Evas_Object* elm_genlist_add(Evas_Object* parent) {
    static const auto add = efl_answers::original<Evas_Object*(Evas_Object*)>("elm_genlist_add");
    Evas_Object* genlist = add ? add(parent) : nullptr;
    if (genlist) {
        evas_object_smart_callback_add(genlist, "theme,changed", themed, nullptr);
        evas_object_event_callback_add(genlist, EVAS_CALLBACK_DEL, listGoes, nullptr);
    }
    return genlist;
}
