#pragma once

#include <Elementary.h>

#include <string>
#include <vector>

namespace bench {

/// The widgets of the program under measurement, as the functions that make them were called. There is one.
class Seen {
public:
    static Seen& get();

    Evas_Object* list = nullptr;
    /// The first scroller since somebody set this to null.
    Evas_Object* pager = nullptr;

    void addImage(Evas_Object* image, const char* file);
    /// An image of that file that has its pixels and lies in the display, drawn by the next frame.
    bool isInSight(const std::string& file) const;
    /// The scroller around an image of that file; null when there is none.
    Evas_Object* scrollerAround(const std::string& file) const;

private:
    struct Image {
        Evas_Object* object;
        std::string file;
    };
    std::vector<Image> images_;
};

}  // namespace bench
