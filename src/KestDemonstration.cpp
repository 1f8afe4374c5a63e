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

void onSignal(Evas_Object* layout, const char* signal, Edje_Signal_Cb callback, void* data) {
    edje_object_signal_callback_add(elm_layout_edje_get(layout), signal, "*", callback, data);
}

}  // namespace

KestDemonstration::KestDemonstration(KestPictureArea& pictureArea, app_assist::WView& pageView)
    : area(pictureArea), view(pageView), state(State::Idle), replyHidden(0) {}

KestDemonstration::~KestDemonstration() {
    app_assist::WUiTimer::destroy(timer);
}

void KestDemonstration::createButtonHorizontal(Evas_Object* imageLayout) {
    onSignal(imageLayout, replyPressed, __pressedCb, this);
    onSignal(imageLayout, replyReleased, __releasedCb, this);
}

void KestDemonstration::createButtonVertical(Evas_Object* imageLayout) {
    createButtonHorizontal(imageLayout);
}

void KestDemonstration::stop() {
    app_assist::WUiTimer::destroy(timer);
    state = State::Idle;
    replyHidden = 0;
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

void KestDemonstration::__start(State next, double seconds, Step step) {
    app_assist::WUiTimer::destroy(timer);
    state = next;
    timer = app_assist::WUiTimer::addTimer(
        seconds, [this, step](app_assist::WView*) { return (this->*step)(); }, &view, area.imageLayout);
}

void KestDemonstration::__end() {
    state = State::Idle;
    replyHidden = 0;
    area.hideTouchMarkers();
    area.emit("reply,show");
}

void KestDemonstration::__press() {
    if (area.isSequence()) {
        KestUsageLog::replyPressed();
    }
    if (!area.isAtStart()) {
        return;
    }
    area.emit("reply,hide");
    if (replyHidden == 0) {
        area.emit("reply,press,show");
    }
}

void KestDemonstration::__release() {
    if (!area.isAtStart()) {
        return;
    }
    replyHidden = 1;
    area.emit("reply,hide");
    if (!area.isSequence()) {
        __start(State::Advancing, secondsToScroll, &KestDemonstration::__scrollStep);
    } else if (area.hasTouchMarker(0)) {
        __start(State::Waiting, secondsToTouch, &KestDemonstration::__touchStep);
    } else {
        area.emitToPage(0, "touch,hide");
        __start(State::Advancing, secondsToAdvance, &KestDemonstration::__advanceStep);
    }
}

bool KestDemonstration::__touchStep() {
    area.emitToPage(area.currentPage(), "touch,show");
    __start(State::Touching, secondsToAdvance, &KestDemonstration::__advanceStep);
    return true;
}

bool KestDemonstration::__advanceStep() {
    const int page = area.currentPage();
    if (area.imageCount - 1 <= page) {
        area.bringPageIn(0);
        __end();
        return false;
    }
    area.bringPageIn(page + 1);
    if (area.hasTouchMarker(page + 1)) {
        __start(State::Waiting, secondsToTouch, &KestDemonstration::__touchStep);
    } else {
        state = State::Advancing;
    }
    return true;
}

bool KestDemonstration::__scrollStep() {
    // A display may show the whole picture, so that nothing moves.
    if (area.isAtStart() && state != State::ScrollingBack) {
        area.bringIn(area.extraHeight);
        state = State::ScrollingBack;
        return true;
    }
    area.bringIn(0);
    __end();
    return false;
}

void KestDemonstration::__pressedCb(void* data, Evas_Object*, const char*, const char*) try {
    static_cast<KestDemonstration*>(data)->__press();
} catch (const std::exception& error) {
    KEST_ERR("%s", error.what());
}

void KestDemonstration::__releasedCb(void* data, Evas_Object*, const char*, const char*) try {
    static_cast<KestDemonstration*>(data)->__release();
} catch (const std::exception& error) {
    KEST_ERR("%s", error.what());
}
