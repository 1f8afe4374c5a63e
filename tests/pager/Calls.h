#pragma once

#include <Elementary.h>
#include <ui_extension.h>

#include <string>
#include <vector>

/// What the pager and its pages asked of EFL and the platform, as far as its effect cannot be seen whole. The calls go
/// through.
namespace calls {

/// Forgets what was so far; the time of story() begins anew.
void forget();

/// The signals that were sent to the theme of a page, counting from 0, and the movements of its pictures, each with
/// the seconds since forget(): "0.0 area reply,hide", "1.0 picture 0 touch,show", "3.0 pictures to page 1",
/// "0.0 pictures at page 0" (at once), "2.0 pictures to y 145". A usage record is told of every page: "0.0 record".
/// Page -1 is the pager: "0.0 pages at page 2".
std::vector<std::string> story(int page = 0);

/// The story of all pages in one: "0.0 page 2: pictures at page 0".
std::vector<std::string> wholeStory();

/// Other calls in their order, those that begin with one of these words: "title", "launch", "resource", "theme", ...
std::vector<std::string> steps(const std::vector<std::string>& words);

/// Has the call of that name give nothing, the how-manieth time from now.
void fail(const std::string& name, int time = 1);
/// Has the call of that name throw "<name> failed", once: the how-manieth time from now.
void throwIn(const std::string& name, int time = 1);
/// What a call of that name does that is to throw.
void throwIfDue(const std::string& name);

/// Has the display be that wide for who asks; 0: as wide as it is.
void setScreenWidth(int width);
/// The windows whose display was asked for its size since forget(), one a question; null for a question without one.
std::vector<const Evas_Object*> windowsAskedForTheScreen();

/// The callback that was registered last for that smart event.
Evas_Smart_Cb smartCallback(const std::string& event);
/// The same for that signal of a theme.
Edje_Signal_Cb signalCallback(const std::string& signal);
/// The callback that was registered last for changes of the theme.
uxt_theme_changed_cb themeCallback();

}  // namespace calls
