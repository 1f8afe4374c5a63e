#pragma once

#include <Elementary.h>
#include <ui_extension.h>

#include <string>

/// Services that several screens share. Static; holds no state.
class KestCommon {
public:
    virtual ~KestCommon() = default;

    /// Reads the application's changeable colour and font tables and applies them to `obj`, or to the whole
    /// application when it is null. The handles go to `*color` and `*font`, for unsetChangeableTable().
    /// False when a table could not be read (logged); a colour table that was read stays.
    static bool setChangeableTable(Evas_Object* obj, uxt_color_table_h* color, uxt_font_table_h* font);
    /// Deletes the tables and zeroes both handles. Always true.
    static bool unsetChangeableTable(uxt_color_table_h* color, uxt_font_table_h* font);

    /// The gettext domain to look `id` up in: "kest" when that knows it, else "contacts". Empty for an empty id.
    static std::string findProperDomain(const std::string& id);
    /// The text of `id` in the display language, `id` itself when there is none. Empty for an empty id.
    static std::string translateString(const std::string& id);

    /// A shown button with its "clicked" callback; `style` null: a plain one; `text` null: none. Null on failure.
    static Evas_Object* createButton(Evas_Object* parent, const char* style, const char* text, Evas_Smart_Cb clicked,
                                     void* data);

    /// Path of the application's theme file: as the resource manager resolves it for this display, or below the
    /// application's resource directory. Empty when it cannot be told.
    static std::string getEdjFilePath(bool useResourceManager);

    /// The region that the device's country code stands for, "Global" where it stands for none. The main menu
    /// file's "state" texts name these regions.
    static std::string getRegion();

    /// Sets `path` to the shared resource directory of an application, with a slash at its end; false, and `path` as it
    /// was, when the application manager does not tell it.
    static bool findSharedResourcePath(const std::string& appid, std::string& path);

    /// As findSharedResourcePath(), or the application's own fixed directory where it finds none.
    static std::string getSharedResourcePath(const std::string& appid);
};
