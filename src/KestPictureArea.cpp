#include "KestPictureArea.h"

#include "KestLog.h"

namespace {

const char touchPart[] = "page.touch";

}  // namespace

const int KestPictureArea::mostPages;
const int KestPictureArea::leastExtraHeight;

KestPictureArea::KestPictureArea(Evas_Object* pagerScroller)
    : scroller(pagerScroller), imageLayout(nullptr), imageCount(0), extraHeight(0), pageCount(0), pages() {}

int KestPictureArea::currentPage() const {
    int page = 0;
    elm_scroller_current_page_get(scroller, &page, nullptr);
    return page;
}

bool KestPictureArea::isAtStart() const {
    if (isSequence()) {
        return currentPage() == 0;
    }
    int y = 0;
    elm_scroller_region_get(scroller, nullptr, &y, nullptr, nullptr);
    return y == 0;
}

void KestPictureArea::bringPageIn(int page) const {
    elm_scroller_page_bring_in(scroller, page, 0);
}

void KestPictureArea::bringIn(int y) const {
    int x = 0;
    int width = 0;
    int height = 0;
    elm_scroller_region_get(scroller, &x, nullptr, &width, &height);
    elm_scroller_region_bring_in(scroller, x, y, width, height);
}

void KestPictureArea::showStart() const {
    if (isSequence()) {
        elm_scroller_page_show(scroller, 0, 0);
    } else if (isTall() && !isAtStart()) {
        int x = 0;
        int width = 0;
        int height = 0;
        elm_scroller_region_get(scroller, &x, nullptr, &width, &height);
        elm_scroller_region_show(scroller, x, 0, width, height);
    }
}

void KestPictureArea::emit(const char* signal) const {
    elm_object_signal_emit(imageLayout, signal, "");
}

void KestPictureArea::emitToPage(int page, const char* signal) const {
    if (page >= 0 && page < pageCount) {
        elm_object_signal_emit(pages[page], signal, "");
    }
}

bool KestPictureArea::hasTouchMarker(int page) const {
    return page >= 0 && page < pageCount && elm_object_part_content_get(pages[page], touchPart);
}

void KestPictureArea::hideTouchMarkers() const {
    for (int page = 0; page < pageCount - 1; ++page) {
        emitToPage(page, "touch,hide");
    }
}

void KestPictureArea::addPage(Evas_Object* page, const std::string& path) {
    WASSERT_EX(pageCount < mostPages, "(pageCount < mostPages)", "the sequence goes on after %d pictures: %s",
               mostPages, path.c_str());
    pages[pageCount] = page;
    ++pageCount;
}
