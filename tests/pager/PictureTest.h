#pragma once

#include "PagerTest.h"

/// A page with pictures, and what stands in its picture area.
class PictureTest : public PagerTest {
protected:
    struct Size {
        int width;
        int height;
        bool operator==(const Size&) const = default;
        friend std::ostream& operator<<(std::ostream& stream, const Size& size) {
            return stream << size.width << 'x' << size.height;
        }
    };

    PictureTest() {
        isDrawn_ = true;
        drawPicture("../contents_not_released.png");
    }

    /// Opens a page of that picture.
    void openPage(const std::string& picture = "a_01.png") {
        writeTips({tip(picture)});
        open();
    }

    static std::string typeOf(const Evas_Object* widget) { return widget ? elm_object_widget_type_get(widget) : ""; }
    /// The theme's group that a layout has loaded.
    static std::string groupOf(Evas_Object* layout);
    /// The file of the picture in a part of a picture's layout; "" where there is none.
    static std::string fileIn(Evas_Object* layout, const char* part);
    static std::vector<std::string> filesIn(const std::vector<Evas_Object*>& layouts, const char* part = "page");
    /// How large the sizer has a picture be at least.
    static Size sizeOf(Evas_Object* layout);

    /// Bytes of this process in memory.
    static std::size_t memory();

    bool showsPlaceholder() { return typeOf(video()) == "Elm_Image" && fileOf(video()) == placeholder(); }
    std::string placeholder() const { return (resources() / "contents/contents_not_released.png").string(); }

    static kest_log::Line info(const std::string& function, const std::string& message) {
        return kest_log::info("KestPictureBuilder.cpp", function, message);
    }
    static kest_log::Line warning(const std::string& function, const std::string& message) {
        return kest_log::warning("KestPictureBuilder.cpp", function, message);
    }
    static kest_log::Line error(const std::string& function, const std::string& message) {
        return kest_log::error("KestPictureBuilder.cpp", function, message);
    }
    static kest_log::Line hit(const std::string& function) { return kest_log::hit("KestPictureBuilder.cpp", function); }
    /// What the log has of how the pictures were built.
    std::vector<kest_log::Line> buildLog() { return newLogOf("KestPictureBuilder.cpp"); }
};
