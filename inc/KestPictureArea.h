#pragma once

#include <Elementary.h>

#include <string>

/// The pictures of a page as its demonstration moves them: a sequence of pages side by side, one tall picture that
/// scrolls down, or a picture that does not move. Owns nothing: the page's layout has all of it.
class KestPictureArea {
public:
    /// A sequence has no more pictures than this.
    static const int mostPages = 16;

    /// `pagerScroller` stands for the scroller until the area has one of its own.
    explicit KestPictureArea(Evas_Object* pagerScroller);

    bool isSequence() const { return imageCount >= 2; }
    /// A tall picture that is worth scrolling.
    bool isTall() const { return !isSequence() && extraHeight > leastExtraHeight; }

    /// The picture in view.
    int currentPage() const;
    /// The first picture, or the top of a tall one, is in view.
    bool isAtStart() const;
    void bringPageIn(int page) const;
    /// Scrolls a tall picture there.
    void bringIn(int y) const;
    /// The same as an animated return to the start, but at once.
    void showStart() const;

    /// A signal to the theme of the whole area.
    void emit(const char* signal) const;
    /// A signal to the theme of one picture. Nothing where there is none.
    void emitToPage(int page, const char* signal) const;
    bool hasTouchMarker(int page) const;
    /// Those of all pictures but the last one, whose marker stays.
    void hideTouchMarkers() const;

    /// Takes a picture's layout in. Ends the process when there are too many; `path` names the sequence.
    void addPage(Evas_Object* page, const std::string& path);

    Evas_Object* scroller;
    /// The layout whose theme has the reply button; null where nothing moves.
    Evas_Object* imageLayout;
    /// 0 for a picture that stands still or the placeholder, 1 for a tall one, else how many the sequence has.
    int imageCount;
    /// By how much a tall picture is higher than the area, in pixels of the picture.
    int extraHeight;
    int pageCount;
    Evas_Object* pages[mostPages];

private:
    /// Less is not worth a demonstration.
    static const int leastExtraHeight = 100;
};
