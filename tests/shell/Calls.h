#pragma once

#include <functional>
#include <set>
#include <string>
#include <vector>

/// What the application asked of EFL and the platform, in order, each as the call's name and its arguments as far as
/// they matter ("uxt_theme_set_style 2"). Objects and handles go by names. The calls go through.
namespace calls {

/// Since the process began or forget().
const std::vector<std::string>& made();
/// Those that begin with one of these names, in their order.
std::vector<std::string> madeOf(const std::vector<std::string>& names);
void forget();

/// Calls `look` whenever elm_language_set() is called, before that goes through.
void whenTheLanguageIsSet(std::function<void()> look);
/// Calls `look` whenever a usage record is written.
void whenARecordIsWritten(std::function<void()> look);
/// Lets every call of that name fail: it gives nothing.
void fail(const std::string& name);
/// Whether the window manager takes rotations; in memory it does not.
void setRotationSupported(bool supported);

}  // namespace calls
