#pragma once

#include "KestPictureArea.h"

#include <cstdint>
#include <string>

/// Builds a page's picture area from the path of its first picture: the placeholder, a picture that stands still, a
/// tall one, or a sequence, as the files and their sizes say.
class KestPictureBuilder {
public:
    /// `area` is filled; `window` tells how wide the screen is.
    KestPictureBuilder(KestPictureArea& pictureArea, Evas_Object* viewWindow);

    /// Puts the area into the page. `pageLayout` owns all that is made.
    void build(Evas_Object* pageLayout, const std::string& imagePath);

private:
    struct Size {
        int width;
        int height;
    };

    void __buildPlaceholder(Evas_Object* pageLayout);
    void __buildSingle(Evas_Object* pageLayout, const std::string& imagePath);
    void __buildTall(Evas_Object* pageLayout, const std::string& imagePath);
    void __buildSequence(Evas_Object* pageLayout, const std::string& firstPath, const std::string& secondPath);
    Evas_Object* __addImageLayout(Evas_Object* pageLayout);
    Evas_Object* __createPagingScroller();
    /// A page that could not be made counts, but is not packed.
    void __packPage(Evas_Object* box, Evas_Object* page);

    Evas_Object* __createPage(Evas_Object* parent, const std::string& picturePath);
    Evas_Object* __createVerticalPage(Evas_Object* parent, const std::string& imagePath);
    /// The picture of a page: the variant, where there is one, else the picture itself, else the placeholder.
    Evas_Object* __createPicture(Evas_Object* page, const std::string& variantPath, const std::string& picturePath);
    /// Null for a file that is no picture, or one that the page has no room for.
    Evas_Object* __createReadableImage(Evas_Object* page, const std::string& path);
    /// An image without a file where that is no picture or too large.
    Evas_Object* __createImage(Evas_Object* parent, const std::string& path);
    void __setFile(Evas_Object* image, const std::string& path) const;
    void __setSizer(Evas_Object* page, const Size& least) const;
    Evas_Object* __createLayout(Evas_Object* parent, const char* group) const;
    int __pageWidth() const;

    KestPictureArea& area;
    Evas_Object* window;
    std::string themeFile;
    /// How many pixels the pictures and markers of the page may still have: they are decoded, four bytes each, for as
    /// long as the page is there.
    std::int64_t pixelsLeft;
};
