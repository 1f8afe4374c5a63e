#pragma once

namespace bench {

/// What a program is visited for: the first picture of the page whose row is tapped, which menu that row is, counted
/// from 0, how many pages the pager has, and the picture that is higher than the area, with its page. Without that one
/// the visit ends when the page has been opened. All by these variables.
constexpr char pictureVariable[] = "VISIT_PICTURE";
constexpr char menuVariable[] = "VISIT_MENU";
constexpr char pagesVariable[] = "VISIT_PAGES";
constexpr char tallPictureVariable[] = "VISIT_TALL_PICTURE";
constexpr char tallPageVariable[] = "VISIT_TALL_PAGE";

// What the visit tells, a line each, a word and numbers; times in milliseconds, memory in megabytes.

/// Frames since the push, and the time that passed and that of the processor since the tap, to the page drawn.
constexpr char drawnLine[] = "drawn";
/// A page of the others filled: how long the main loop was held.
constexpr char filledLine[] = "filled";
/// The longest that the main loop was held otherwise, from then until the program rested.
constexpr char otherLine[] = "other";
/// A frame of a swipe, and one of the tall picture's scroll.
constexpr char swipeLine[] = "swipe";
constexpr char scrollLine[] = "scroll";
/// What is resident with all pages filled, and the most that was.
constexpr char memoryLine[] = "memory";

}  // namespace bench
