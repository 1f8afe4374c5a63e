#pragma once

#include <Elementary.h>

#ifdef __cplusplus
extern "C" {
#endif

/** A changeable colour or font table that was read from a file. Opaque; zero means none. */
typedef struct uxt_color_table* uxt_color_table_h;
typedef struct uxt_font_table* uxt_font_table_h;

/** Which colours apply, of the tables and of the device's own widget styles. */
typedef enum {
    UXT_THEME_STYLE_LIGHT = 0,
    UXT_THEME_STYLE_DARK = 1,
    UXT_THEME_STYLE_DEVICE = 2 /**< the ones of the device's theme, and on with it when it changes */
} uxt_theme_style_e;

/**
 * Reads a colour table: an XML file that gives each colour class its colour in the light and in the dark theme.
 * @return to be freed with uxt_theme_delete_color_table(); NULL, with a line in the log that names file and
 *         line, when it cannot be read or is no such table
 */
uxt_color_table_h uxt_theme_add_color_table(const char* path);
/**
 * Reads a font table: an XML file that gives each text class its font and size.
 * @return to be freed with uxt_theme_delete_font_table(); NULL as above
 */
uxt_font_table_h uxt_theme_add_font_table(const char* path);
/**
 * Frees a table; where it is in use its classes go back to what the device's theme and the theme files say. NULL does
 * nothing; a handle that is no table (any more) is an error line in the log.
 */
void uxt_theme_delete_color_table(uxt_color_table_h table);
void uxt_theme_delete_font_table(uxt_font_table_h table);

/**
 * Application-wide: whether tables apply (at first they do not), which style (at first the device's), which tables
 * (NULL: none). Live objects change at once, later ones from their start. A table or a style that does not exist is an
 * error line in the log and changes nothing.
 */
void uxt_theme_set_changeable_ui_enabled(Eina_Bool enabled);
void uxt_theme_set_style(int style);
void uxt_theme_set_color_table(uxt_color_table_h table);
void uxt_theme_set_font_table(uxt_font_table_h table);

/**
 * The same for one object and the layouts inside it, also those that come later; it wins over what is set
 * application-wide. What is not set for the object (its style, a table) is as set application-wide; what is set for
 * an object inside it is that one's alone. It ends with the object.
 */
void uxt_theme_object_set_changeable_ui_enabled(Evas_Object* obj, Eina_Bool enabled);
void uxt_theme_object_set_style(Evas_Object* obj, int style);
void uxt_theme_object_set_color_table(Evas_Object* obj, uxt_color_table_h table);
void uxt_theme_object_set_font_table(Evas_Object* obj, uxt_font_table_h table);

/** Called after the device's theme changed and the colours were applied. */
typedef void (*uxt_theme_changed_cb)(void* user_data);
/**
 * Has `callback` called at every change of the device's theme, once a registration. NULL is an error line in the log.
 * @param obj the object that the callback is about, or NULL (0) for the application. It only tells
 *            registrations apart.
 * @param user_data what the callback gets; it has to live until uxt_theme_delete_changed_callback()
 */
void uxt_theme_add_changed_callback(Evas_Object* obj, uxt_theme_changed_cb callback, void* user_data);
/**
 * Removes the oldest registration of this callback for this object; where there is none, an error line in the log.
 */
void uxt_theme_delete_changed_callback(Evas_Object* obj, uxt_theme_changed_cb callback);

/**
 * Adds a button in a style of the device's theme. A style that the theme lacks is a warning in the log; the button then
 * has the default one.
 * @param style NULL: the default one
 * @return a widget that `parent` owns; NULL when it cannot be made, for example without a parent
 */
Evas_Object* uxt_button_add(Evas_Object* parent, const char* style);

/**
 * Whether a scrolling widget may scroll by itself to bring a child into view that gets the focus. On by default. It
 * leaves fingers and calls that scroll alone.
 */
void uxt_scroller_set_auto_scroll_enabled(Evas_Object* scroller, Eina_Bool enabled);

#ifdef __cplusplus
}
#endif
