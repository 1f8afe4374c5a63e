#include "KestDemonstration.h"

#include "KestLog.h"
#include "KestUsageLog.h"

#include <exception>

namespace {

/// How long a picture is looked at before its marker shows, and until the next one comes.
const double secondsToTouch = 1.0;
const double secondsToAdvance = 2.0;
const double secondsToScroll = 2.0;

const char replyPressed[] = "reply,pressed";
/// The theme's own name for the release.
const char replyReleased[] = "reply,uppressed";

bool canScroll(const KestPictureArea& area) {
    int height = 0;
    int shown = 0;
    elm_scroller_child_size_get(area.scroller, nullptr, &height);
    elm_scroller_region_get(area.scroller, nullptr, nullptr, nullptr, &shown);
    return height > shown;
}

void onSignal(Evas_Object* layout, const char* signal, Edje_Signal_Cb callback, void* data) {
    edje_object_signal_callback_add(elm_layout_edje_get(layout), signal, "*", callback, data);
}

}  // namespace

KestDemonstration::KestDemonstration(KestPictureArea& pictureArea, app_assist::WView& pageView)
    : area(pictureArea), view(pageView), state(State::Idle) {}

KestDemonstration::~KestDemonstration() {
    app_assist::WUiTimer::destroy(timer);
}

void KestDemonstration::createButtonHorizontal(Evas_Object* imageLayout) {
    onSignal(imageLayout, replyPressed, __sequencePressedCb, this);
    onSignal(imageLayout, replyReleased, __sequenceReleasedCb, this);
}

void KestDemonstration::createButtonVertical(Evas_Object* imageLayout) {
    onSignal(imageLayout, replyPressed, __tallPressedCb, this);
    onSignal(imageLayout, replyReleased, __tallReleasedCb, this);
}

void KestDemonstration::stop() {
    app_assist::WUiTimer::destroy(timer);
    state = State::Idle;
}

void KestDemonstration::restart() {
    stop();
    if (area.isSequence() || area.isTall()) {
        // At once: the release is heard only where the first picture is in view.
        area.showStart();
        area.emit(replyReleased);
    }
}

void KestDemonstration::reset() {
    stop();
    if (area.isSequence()) {
        area.showStart();
    } else if (area.isTall() && !area.isAtStart()) {
        area.bringIn(0);
    }
    area.hideTouchMarkers();
}

void KestDemonstration::__enter(State next, double seconds) {
    app_assist::WUiTimer::destroy(timer);
    state = next;
    timer = app_assist::WUiTimer::addTimer(
        seconds, [this](app_assist::WView*) { return __step(); }, &view, area.imageLayout);
}

void KestDemonstration::__press() {
    if (!area.isAtStart()) {
        return;
    }
    area.emit("reply,hide");
    if (!replyHidden()) {
        area.emit("reply,press,show");
    }
}

void KestDemonstration::__releaseSequence() {
    if (!area.isAtStart()) {
        return;
    }
    area.emit("reply,hide");
    if (area.hasTouchMarker(0)) {
        __enter(State::Waiting, secondsToTouch);
    } else {
        area.emitToPage(0, "touch,hide");
        __enter(State::Advancing, secondsToAdvance);
    }
}

void KestDemonstration::__releaseTall() {
    if (area.isAtStart()) {
        area.emit("reply,hide");
        __enter(State::Scrolling, secondsToScroll);
    }
}

bool KestDemonstration::__step() {
    switch (state) {
    case State::Waiting:
        return __touch();
    case State::Touching:
    case State::Advancing:
        return __advance();
    case State::Scrolling:
        return __scroll();
    case State::ScrollingBack:
        return __scrollBack();
    case State::Idle:
        break;
    }
    return false;
}

bool KestDemonstration::__touch() {
    area.emitToPage(area.currentPage(), "touch,show");
    __enter(State::Touching, secondsToAdvance);
    return true;
}

bool KestDemonstration::__advance() {
    const int page = area.currentPage();
    if (area.imageCount - 1 <= page) {
        area.bringPageIn(0);
        __end();
        return false;
    }
    area.bringPageIn(page + 1);
    if (area.hasTouchMarker(page + 1)) {
        __enter(State::Waiting, secondsToTouch);
    } else {
        state = State::Advancing;
    }
    return true;
}

bool KestDemonstration::__scroll() {
    if (!area.isAtStart()) {
        return __scrollBack();
    }
    area.bringIn(area.extraHeight);
    state = State::ScrollingBack;
    return true;
}

bool KestDemonstration::__scrollBack() {
    // Something else may have brought it back. Where the display shows all of it, it never moves.
    if (area.isAtStart() && canScroll(area)) {
        return __scroll();
    }
    area.bringIn(0);
    __end();
    return false;
}

void KestDemonstration::__end() {
    state = State::Idle;
    area.hideTouchMarkers();
    area.emit("reply,show");
}

void KestDemonstration::__sequencePressedCb(void* data, Evas_Object*, const char*, const char*) try {
    auto* demonstration = static_cast<KestDemonstration*>(data);
    if (!demonstration) {
        KEST_ERR("data is null");
        return;
    }
    KestUsageLog::replyPressed();
    demonstration->__press();
} catch (const std::exception& error) {
    KEST_ERR("%s", error.what());
}

void KestDemonstration::__sequenceReleasedCb(void* data, Evas_Object*, const char*, const char*) try {
    auto* demonstration = static_cast<KestDemonstration*>(data);
    if (!demonstration) {
        KEST_ERR("data is null");
        return;
    }
    demonstration->__releaseSequence();
} catch (const std::exception& error) {
    KEST_ERR("%s", error.what());
}

void KestDemonstration::__tallPressedCb(void* data, Evas_Object*, const char*, const char*) try {
    auto* demonstration = static_cast<KestDemonstration*>(data);
    if (!demonstration) {
        KEST_ERR("data is null");
        return;
    }
    demonstration->__press();
} catch (const std::exception& error) {
    KEST_ERR("%s", error.what());
}

void KestDemonstration::__tallReleasedCb(void* data, Evas_Object*, const char*, const char*) try {
    auto* demonstration = static_cast<KestDemonstration*>(data);
    if (!demonstration) {
        KEST_ERR("data is null");
        return;
    }
    demonstration->__releaseTall();
} catch (const std::exception& error) {
    KEST_ERR("%s", error.what());
}
