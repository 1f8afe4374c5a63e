// Loaded ahead of a program (LD_PRELOAD) that shows a list and opens a pager: in place of its main loop's plain run it
// taps a row, waits for the pages, swipes through all of them and scrolls the tall picture, and tells what that cost.

#include "Visit.h"
#include "FrameWatch.h"
#include "LoopWatch.h"
#include "Program.h"
#include "Seen.h"

#include <algorithm>
#include <cstdio>
#include <cstdlib>
#include <stdexcept>
#include <string>

#include <sys/resource.h>
#include <unistd.h>

namespace {

using bench::Cost;
using bench::FrameWatch;
using bench::LoopWatch;
using bench::Seen;

/// Nothing takes that long, even on a busy machine.
constexpr double patience = 10;
/// Until everything that an action set off has come to rest; shorter than what the demonstrations wait for.
constexpr double rest = 0.4;

FILE* told = nullptr;

void tell(const char* line, const Cost& cost) {
    std::fprintf(told, "%s %.4f %.4f\n", line, cost.passed, cost.processor);
}

void must(bool done, const std::string& what) {
    if (!done) {
        throw std::runtime_error(what);
    }
}

const char* variable(const char* name) {
    const char* value = getenv(name);
    return value ? value : "";
}

/// A finger on the display.
class Finger {
public:
    void down(int x, int y) {
        evas_event_feed_mouse_in(canvas(), time(), nullptr);
        moveTo(x, y);
        evas_event_feed_mouse_down(canvas(), 1, EVAS_BUTTON_NONE, time(), nullptr);
    }
    void moveTo(int x, int y) { evas_event_feed_mouse_move(canvas(), x, y, time(), nullptr); }
    void up() { evas_event_feed_mouse_up(canvas(), 1, EVAS_BUTTON_NONE, time(), nullptr); }

private:
    static Evas* canvas() { return FrameWatch::get().canvas(); }
    static unsigned time() { return static_cast<unsigned>(ecore_time_get() * 1000); }
};

/// The row of a menu: rows that cannot be chosen do not count.
Elm_Object_Item* rowOf(int menu) {
    Elm_Object_Item* row = elm_genlist_first_item_get(Seen::get().list);
    for (int rows = 0; row; row = elm_genlist_item_next_get(row)) {
        if (elm_genlist_item_select_mode_get(row) != ELM_OBJECT_SELECT_MODE_DISPLAY_ONLY && rows++ == menu) {
            break;
        }
    }
    return row;
}

bool listIsDrawn() {
    Eina_List* rows = Seen::get().list ? elm_genlist_realized_items_get(Seen::get().list) : nullptr;
    eina_list_free(rows);
    return rows && !FrameWatch::get().frames().empty();
}

/// Taps the row until the pager comes: on a busy machine a tap may last so long that it is none. Returns when the
/// finger was lifted.
Cost tap(Elm_Object_Item* row) {
    constexpr int attempts = 5;
    Evas_Object* track = elm_object_item_track(row);
    int x = 0, y = 0, width = 0, height = 0;
    evas_object_geometry_get(track, &x, &y, &width, &height);
    elm_object_item_untrack(row);
    for (int i = 0; i < attempts; ++i) {
        Finger finger;
        finger.down(x + width / 2, y + height / 2);
        LoopWatch::get().runFor(0.05);
        Seen::get().pager = nullptr;
        LoopWatch::get().forgetTurns();
        const Cost lifted = Cost::ofProcess();
        finger.up();
        if (LoopWatch::get().runUntil([] { return Seen::get().pager; }, 1)) {
            return lifted;
        }
    }
    throw std::runtime_error("a tap did not open a page");
}

void openPage() {
    must(LoopWatch::get().runUntil(listIsDrawn, patience), "no list");
    Elm_Object_Item* row = rowOf(atoi(variable(bench::menuVariable)));
    must(row, "no such row");
    elm_genlist_item_show(row, ELM_GENLIST_ITEM_SCROLLTO_IN);
    LoopWatch::get().runFor(rest);

    FrameWatch::get().lookFor([] { return Seen::get().isInSight(variable(bench::pictureVariable)); });
    const Cost lifted = tap(row);
    must(LoopWatch::get().runUntil([] { return FrameWatch::get().wasDrawn(); }, patience), "the page was not drawn");
    const Cost passed = FrameWatch::get().drawnTime() - lifted;
    std::fprintf(told, "%s %d %.4f %.4f\n", bench::drawnLine, FrameWatch::get().drawnFrame(), passed.passed,
                 passed.processor);
}

int pagesFilled() {
    int filled = 0;
    for (const LoopWatch::Turn& turn : LoopWatch::get().turns()) {
        filled += turn.notes;
    }
    return filled;
}

/// Turns since the tap: the first one that filled a page filled the chosen one.
void fillOthers() {
    const int pages = atoi(variable(bench::pagesVariable));
    must(LoopWatch::get().runUntil([pages] { return pagesFilled() == pages; }, patience), "pages are missing");
    LoopWatch::get().runFor(rest);
    Cost longest;
    int filled = 0;
    for (const LoopWatch::Turn& turn : LoopWatch::get().turns()) {
        if (turn.notes > 0 && filled > 0) {
            tell(bench::filledLine, turn.cost);
        } else if (filled > 1 && turn.cost.passed > longest.passed) {
            longest = turn.cost;
        }
        filled += turn.notes;
    }
    tell(bench::otherLine, longest);
}

/// Whether a movement of a scroller has ended.
class Movement {
public:
    explicit Movement(Evas_Object* scroller) : scroller_(scroller) {
        evas_object_smart_callback_add(scroller, "scroll,anim,stop", stopped, this);
    }
    ~Movement() { evas_object_smart_callback_del_full(scroller_, "scroll,anim,stop", stopped, this); }
    Movement(const Movement&) = delete;
    Movement& operator=(const Movement&) = delete;

    /// Waits for the end, and for the frame that shows it.
    void awaitEnd() const {
        must(LoopWatch::get().runUntil([this] { return ended_; }, patience), "a movement did not end");
        const size_t frames = FrameWatch::get().frames().size();
        LoopWatch::get().runUntil([frames] { return FrameWatch::get().frames().size() > frames; }, 0.05);
    }

private:
    static void stopped(void* self, Evas_Object*, void*) { static_cast<Movement*>(self)->ended_ = true; }

    Evas_Object* scroller_;
    bool ended_ = false;
};

void tellFrames(const char* line) {
    for (const Cost& frame : FrameWatch::get().frames()) {
        tell(line, frame);
    }
}

int pageInView() {
    int page = 0;
    elm_scroller_current_page_get(Seen::get().pager, &page, nullptr);
    return page;
}

void swipe() {
    constexpr int begin = 680, end = 60, y = 400, moves = 10;
    constexpr double seconds = 0.15;
    FrameWatch::get().forget();
    Finger finger;
    finger.down(begin, y);
    for (int i = 1; i <= moves; ++i) {
        LoopWatch::get().runFor(seconds / moves);
        finger.moveTo(begin + (end - begin) * i / moves, y);
    }
    const Movement movement(Seen::get().pager);
    finger.up();
    movement.awaitEnd();
    tellFrames(bench::swipeLine);
    LoopWatch::get().runFor(rest);
}

/// A busy machine may make a swipe so slow that the page comes back; its frames count, and it is swiped again.
void swipeToNext() {
    constexpr int attempts = 5;
    const int page = pageInView();
    for (int i = 0; i < attempts && pageInView() == page; ++i) {
        swipe();
    }
    must(pageInView() == page + 1, "no swipe led from page " + std::to_string(page) + " to the next one");
}

void scrollTo(Evas_Object* scroller, int y) {
    int width = 0, height = 0;
    elm_scroller_region_get(scroller, nullptr, nullptr, &width, &height);
    FrameWatch::get().forget();
    const Movement movement(scroller);
    elm_scroller_region_bring_in(scroller, 0, y, width, height);
    movement.awaitEnd();
    tellFrames(bench::scrollLine);
}

void scrollTallPicture() {
    Evas_Object* scroller = Seen::get().scrollerAround(variable(bench::tallPictureVariable));
    must(scroller && scroller != Seen::get().pager, "no tall picture");
    int height = 0, viewport = 0;
    elm_scroller_child_size_get(scroller, nullptr, &height);
    elm_scroller_region_get(scroller, nullptr, nullptr, nullptr, &viewport);
    scrollTo(scroller, height - viewport);
    scrollTo(scroller, 0);
}

double residentMegabytes() {
    long pages = 0;
    FILE* file = std::fopen("/proc/self/statm", "r");
    const bool known = file && std::fscanf(file, "%*d %ld", &pages) == 1;
    if (file) {
        std::fclose(file);
    }
    must(known, "no /proc/self/statm");
    return static_cast<double>(pages) * static_cast<double>(sysconf(_SC_PAGESIZE)) / 1048576;
}

void visit() {
    openPage();
    if (!*variable(bench::tallPictureVariable)) {
        return;
    }
    fillOthers();
    const double resident = residentMegabytes();
    const int tallPage = atoi(variable(bench::tallPageVariable));
    for (int page = 1; page < atoi(variable(bench::pagesVariable)); ++page) {
        swipeToNext();
        if (page == tallPage) {
            scrollTallPicture();
            LoopWatch::get().runFor(rest);
        }
    }
    rusage usage{};
    getrusage(RUSAGE_SELF, &usage);
    std::fprintf(told, "%s %.1f %.1f\n", bench::memoryLine, resident, static_cast<double>(usage.ru_maxrss) / 1024);
}

}  // namespace

extern "C" void elm_run() {
    told = fdopen(atoi(variable(bench::toldVariable)), "w");
    if (!told) {
        _exit(1);
    }
    LoopWatch::get().begin();
    int status = 0;
    try {
        visit();
    } catch (const std::exception& failure) {
        std::fprintf(told, "%s\n", failure.what());
        status = 1;
    }
    std::fflush(told);
    _exit(status);
}
