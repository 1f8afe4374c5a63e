#pragma once

#include "KestPictureArea.h"

#include <app-assist/WUiTimer.h>

/// Plays a page's pictures by itself: a sequence pages on, with a marker that shows where to touch, a tall picture
/// scrolls down and back. Begins when the theme says that its reply button was released; a page that is displayed sends
/// that signal itself.
///
/// | state         | after             | what happens then                                                     |
/// |---------------|-------------------|-----------------------------------------------------------------------|
/// | Idle          | the release       | Waiting where the first picture has a marker, else Advancing;         |
/// |               |                   | Scrolling with a tall picture                                         |
/// | Waiting       | secondsToTouch    | the marker of the picture in view shows: Touching                     |
/// | Touching      | secondsToAdvance  | the next picture comes: Waiting or Advancing as it has a marker;      |
/// | Advancing     | secondsToAdvance  | after the last one the first one comes back: Idle                     |
/// | Scrolling     | secondsToScroll   | a tall picture scrolls down: ScrollingBack                            |
/// | ScrollingBack | secondsToScroll   | it scrolls back: Idle; or down, if it is back already                 |
///
/// The reply button is hidden in every state but Idle. At most one timer is pending, and none outlives the page.
class KestDemonstration {
public:
    enum class State { Idle, Waiting, Touching, Advancing, Scrolling, ScrollingBack };

    /// Both outlive it. The timers end with the view and with the area's layout.
    KestDemonstration(KestPictureArea& pictureArea, app_assist::WView& pageView);
    ~KestDemonstration();
    KestDemonstration(const KestDemonstration&) = delete;
    KestDemonstration& operator=(const KestDemonstration&) = delete;

    /// Listens to the reply button of the layout of a sequence.
    void createButtonHorizontal(Evas_Object* imageLayout);
    /// The same for a tall picture.
    void createButtonVertical(Evas_Object* imageLayout);

    /// Whether a run has the reply button hidden.
    bool replyHidden() const { return state != State::Idle; }

    /// Ends it where it is; the pictures stay as they are.
    void stop();
    /// Ends it and starts over from the first picture.
    void restart();
    /// Ends it because the page is swiped: back to the first picture.
    void reset();

private:
    /// The next step comes after so many seconds, and again as long as steps return true.
    void __enter(State next, double seconds);
    void __press();
    void __releaseSequence();
    void __releaseTall();
    /// What the state has due. Nothing when it is idle.
    bool __step();
    bool __touch();
    bool __advance();
    bool __scroll();
    bool __scrollBack();
    void __end();

    static void __sequencePressedCb(void* data, Evas_Object* obj, const char* emission, const char* source);
    static void __sequenceReleasedCb(void* data, Evas_Object* obj, const char* emission, const char* source);
    static void __tallPressedCb(void* data, Evas_Object* obj, const char* emission, const char* source);
    static void __tallReleasedCb(void* data, Evas_Object* obj, const char* emission, const char* source);

    KestPictureArea& area;
    app_assist::WView& view;
    State state;
    /// The one pending timer.
    app_assist::WUiTimer::Handle timer;
};
