#pragma once

#include <Elementary.h>

#ifdef __cplusplus
extern "C" {
#endif

/** A changeable colour or font table that was read from a file. Opaque; zero means none. */
typedef struct uxt_color_table* uxt_color_table_h;
typedef struct uxt_font_table* uxt_font_table_h;

/** Which colours of a table apply. */
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
/** Reads a font table: an XML file that gives each text class its font and size. Otherwise as above. */
uxt_font_table_h uxt_theme_add_font_table(const char* path);
/** Frees a table; where it is in use its classes go back to what the theme files say. */
void uxt_theme_delete_color_table(uxt_color_table_h table);
void uxt_theme_delete_font_table(uxt_font_table_h table);

/** Application-wide: whether tables apply, which style, which tables. Live objects change at once. */
void uxt_theme_set_changeable_ui_enabled(Eina_Bool enabled);
void uxt_theme_set_style(int style);
void uxt_theme_set_color_table(uxt_color_table_h table);
void uxt_theme_set_font_table(uxt_font_table_h table);

/** The same for one object and the layouts inside it; wins over what is set application-wide. */
void uxt_theme_object_set_changeable_ui_enabled(Evas_Object* obj, Eina_Bool enabled);
void uxt_theme_object_set_style(Evas_Object* obj, int style);
void uxt_theme_object_set_color_table(Evas_Object* obj, uxt_color_table_h table);
void uxt_theme_object_set_font_table(Evas_Object* obj, uxt_font_table_h table);

/** Called after the device's theme changed and the colours were applied. */
typedef void (*uxt_theme_changed_cb)(void* user_data);
/**
 * @param obj the object that the callback is about, or NULL (0) for the application. It only tells
 *            registrations apart.
 */
void uxt_theme_add_changed_callback(Evas_Object* obj, uxt_theme_changed_cb callback, void* user_data);
/** Removes the oldest registration of this callback for this object. */
void uxt_theme_delete_changed_callback(Evas_Object* obj, uxt_theme_changed_cb callback);

/** Adds a button in a style of the device's theme. @return NULL when it cannot be made */
Evas_Object* uxt_button_add(Evas_Object* parent, const char* style);

/** Whether the scroller may scroll by itself to bring a focused child into view. On by default. */
void uxt_scroller_set_auto_scroll_enabled(Evas_Object* scroller, Eina_Bool enabled);

#ifdef __cplusplus
}
#endif
