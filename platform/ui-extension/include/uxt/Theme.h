#pragma once

/// What the application framework tells the theme; applications use ui_extension.h.
/// Both functions belong to the main loop's thread, after elm_init().
namespace uxt {

/// Installs the device's widget styles as an overlay (once a process) and gives them, and the application's tables
/// of style UXT_THEME_STYLE_DEVICE, the colours of the light or the dark theme. Live widgets change at once. A theme
/// file that cannot be read is said in the log (tag "UXT") and leaves everything as it was.
void applyDeviceTheme(bool dark);

/// Tells the application that the device's theme has changed, after applyDeviceTheme(): applies the tables anew, then
/// calls the callbacks of uxt_theme_add_changed_callback(), oldest first. A callback may add and remove callbacks:
/// what it removes is not called any more, what it adds is called from the next change on.
void themeChanged();

}  // namespace uxt
