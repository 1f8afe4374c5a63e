#include "PageFinger.h"

#include "Guarded.h"

#include <algorithm>
#include <cstdlib>
#include <memory>

namespace app_assist {

namespace {

/// In seconds: what is looked at for the speed.
constexpr double lately = 0.1;
/// In widths of the page, and those a second.
constexpr double farWay = 0.5;
constexpr double flickSpeed = 0.8;
constexpr double flickWay = 0.1;

}  // namespace

PageFinger& PageFinger::attach(Evas_Object* scroller, BounceGuard& guard) {
    std::unique_ptr<PageFinger> finger(new PageFinger(scroller, guard));
    const auto onEvas = [&](Evas_Callback_Type event, Evas_Object_Event_Cb callback) {
        evas_object_event_callback_add(scroller, event, callback, finger.get());
    };
    onEvas(EVAS_CALLBACK_MOUSE_DOWN, [](void* self, Evas*, Evas_Object*, void* event) {
        const auto* down = static_cast<Evas_Event_Mouse_Down*>(event);
        if (down->button == 1)
            static_cast<PageFinger*>(self)->touched({down->timestamp / 1000.0, down->canvas.x});
    });
    onEvas(EVAS_CALLBACK_MOUSE_MOVE, [](void* self, Evas*, Evas_Object*, void* event) {
        const auto* move = static_cast<Evas_Event_Mouse_Move*>(event);
        static_cast<PageFinger*>(self)->moved({move->timestamp / 1000.0, move->cur.canvas.x});
    });
    onEvas(EVAS_CALLBACK_MOUSE_UP, [](void* self, Evas*, Evas_Object*, void* event) {
        const auto* up = static_cast<Evas_Event_Mouse_Up*>(event);
        if (up->button == 1)
            static_cast<PageFinger*>(self)->lifted({up->timestamp / 1000.0, up->canvas.x});
    });
    onEvas(EVAS_CALLBACK_FREE, [](void* data, Evas*, Evas_Object*, void*) {
        const std::unique_ptr<PageFinger> self(static_cast<PageFinger*>(data));
        if (self->job_)
            ecore_job_del(self->job_);
    });
    evas_object_smart_callback_add(
        scroller, "scroll,drag,start",
        [](void* self, Evas_Object*, void*) { static_cast<PageFinger*>(self)->dragged(); }, finger.get());
    // The scroller has it from now on.
    return *finger.release();
}

void PageFinger::touched(Place place) {
    began_ = place.x;
    kept_.reset();
    page_.reset();
    lately_.clear();
    moved(place);
}

void PageFinger::moved(Place place) {
    guarded("a finger on the pages", [&] { lately_.push_back(place); });
    while (lately_.size() > 2 && lately_.back().time - lately_.front().time > lately)
        lately_.pop_front();
}

void PageFinger::dragged() {
    page_ = pageInView();
}

void PageFinger::lifted(Place place) {
    // A finger that rested before it was lifted did not flick.
    moved(place);
    // Not at once: EFL goes on to decide which page comes.
    if (!job_)
        job_ = ecore_job_add([](void* self) { static_cast<PageFinger*>(self)->turn(); }, this);
}

void PageFinger::turn() {
    job_ = nullptr;
    if (const auto page = pageToTurnTo())
        guard_.redirect([&] { elm_scroller_page_bring_in(scroller_, *page, 0); });
}

/// None: where EFL decided that it goes.
std::optional<int> PageFinger::pageToTurnTo() const {
    if (kept_ && page_)
        return kept_;
    if (const auto page = neighbour())
        return page;
    if (guard_.isMoving() || !isHalfway())
        return std::nullopt;
    return pageInView();
}

int PageFinger::pageInView() const {
    int page = 0;
    elm_scroller_current_page_get(scroller_, &page, nullptr);
    return page;
}

std::optional<int> PageFinger::neighbour() const {
    const int pages = page_ ? pagesToTurn() : 0;
    if (pages == 0)
        return std::nullopt;
    int last = 0;
    elm_scroller_last_page_get(scroller_, &last, nullptr);
    const int page = *page_ + pages;
    return page >= 0 && page <= last ? std::optional(page) : std::nullopt;
}

/// Within a pixel it is at its place: a row of one page has that much more.
bool PageFinger::isHalfway() const {
    int x = 0, width = 0;
    elm_scroller_region_get(scroller_, &x, nullptr, &width, nullptr);
    const int beyond = width > 0 ? std::abs(x % width) : 0;
    return std::min(beyond, width - beyond) > 1;
}

int PageFinger::pagesToTurn() const {
    int width = 0;
    elm_scroller_region_get(scroller_, nullptr, nullptr, &width, nullptr);
    if (width <= 0 || lately_.empty())
        return 0;
    const double way = static_cast<double>(lately_.back().x - began_) / width;
    const double time = lately_.back().time - lately_.front().time;
    const double speed = time > 0 ? (lately_.back().x - lately_.front().x) / time / width : 0;
    const bool turns =
        std::abs(speed) >= flickSpeed ? std::abs(way) >= flickWay && (speed > 0) == (way > 0) : std::abs(way) >= farWay;
    if (!turns)
        return 0;
    const int forth = elm_object_mirrored_get(scroller_) ? 1 : -1;
    return way > 0 ? forth : -forth;
}

}  // namespace app_assist
