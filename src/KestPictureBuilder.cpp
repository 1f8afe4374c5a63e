#include "KestPictureBuilder.h"

#include "KestCommon.h"
#include "KestLog.h"
#include "KestPaths.h"
#include "KestPictureFile.h"
#include "KestPicturePaths.h"
#include "KestPlatformString.h"
#include "KestSizeHints.h"

#include <app_resource_manager.h>
#include <system_settings.h>

#include <cstdint>

namespace {

const char placeholderFile[] = "contents/contents_not_released.png";
const char videoPart[] = "video";

/// The area in the picture's own measures.
const int areaWidth = 716;
const int areaHeight = 655;

const double marginInUnits = 4.0;
const int leastWidthOfPage = 600;
const int heightOfNarrowPage = 369;
/// What a low-density display shows less of a tall picture.
const int lowDensityCut = 138;

/// A picture that has more is left out: decoded, it takes four bytes each.
const std::int64_t mostPixels = 4 * 1024 * 1024;
/// Room for as many pictures as a sequence can have, each with a marker.
const std::int64_t mostPixelsOfPage = std::int64_t{2} * KestPictureArea::mostPages * areaWidth * areaHeight;

std::string placeholderPath() {
    return KestCommon::getSharedResourcePath(KEST_APP_ID) + placeholderFile;
}

/// Nothing where the object could not be made.
void put(Evas_Object* layout, const char* part, Evas_Object* object) {
    if (!object) {
        return;
    }
    elm_object_part_content_set(layout, part, object);
    evas_object_show(object);
}

bool isRussian() {
    KestPlatformString locale;
    system_settings_get_value_string(SYSTEM_SETTINGS_KEY_LOCALE_LANGUAGE, locale.out());
    KEST_INFO("locale = %s", locale ? locale.get() : "");
    return locale.str() == "ru_RU";
}

bool isLowDensity() {
    KestPlatformString path;
    app_resource_manager_get(APP_RESOURCE_TYPE_IMAGE, "table/com.ravella.kest_ChangeableColorInfo.xml", path.out());
    return path.str().find("LDPI") != std::string::npos;
}

}  // namespace

KestPictureBuilder::KestPictureBuilder(KestPictureArea& pictureArea, Evas_Object* viewWindow)
    : area(pictureArea), window(viewWindow), themeFile(KestCommon::getEdjFilePath(true)), pixelsLeft(0) {}

void KestPictureBuilder::build(Evas_Object* pageLayout, const std::string& imagePath) {
    area.pageCount = 0;
    pixelsLeft = mostPixelsOfPage;
    if (!KestPicturePaths::isAccessible(imagePath)) {
        __buildPlaceholder(pageLayout);
        return;
    }
    const std::string secondPath = KestPicturePaths::second(imagePath);
    KEST_INFO("secondImagePath is %s", secondPath.c_str());
    if (KestPicturePaths::isAccessible(secondPath)) {
        __buildSequence(pageLayout, imagePath, secondPath);
    } else {
        __buildSingle(pageLayout, imagePath);
    }
}

void KestPictureBuilder::__buildPlaceholder(Evas_Object* pageLayout) {
    put(pageLayout, videoPart, __createImage(pageLayout, placeholderPath()));
}

void KestPictureBuilder::__buildSingle(Evas_Object* pageLayout, const std::string& imagePath) {
    Evas_Object* measured = __createImage(pageLayout, imagePath);
    int width = 0;
    int height = 0;
    elm_image_object_size_get(measured, &width, &height);
    KEST_INFO("weight:%d, height:%d", width, height);
    if (width <= 0 || height <= 0) {
        KEST_WARN("no picture: %s", imagePath.c_str());
        __buildPlaceholder(pageLayout);
    } else if (height <= areaHeight) {
        put(pageLayout, videoPart, __createPage(pageLayout, imagePath));
    } else {
        area.extraHeight = height - areaHeight;
        __buildTall(pageLayout, imagePath);
    }
    // Not before the page has the picture: to delete the only image of a file ends its loading, and the frame that
    // shows the page would wait for it.
    evas_object_del(measured);
}

void KestPictureBuilder::__buildTall(Evas_Object* pageLayout, const std::string& imagePath) {
    Evas_Object* layout = __addImageLayout(pageLayout);
    Evas_Object* scroller = elm_scroller_add(layout);
    area.scroller = scroller;
    elm_object_part_content_set(layout, "scroller", scroller);
    elm_scroller_bounce_set(scroller, EINA_FALSE, EINA_TRUE);
    elm_scroller_policy_set(scroller, ELM_SCROLLER_POLICY_OFF, ELM_SCROLLER_POLICY_AUTO);
    elm_object_style_set(scroller, "effect");
    evas_object_show(scroller);
    elm_scroller_movement_block_set(scroller, ELM_SCROLLER_MOVEMENT_BLOCK_VERTICAL);
    elm_scroller_policy_set(scroller, ELM_SCROLLER_POLICY_OFF, ELM_SCROLLER_POLICY_OFF);
    elm_object_content_set(scroller, __createVerticalPage(scroller, imagePath));
    area.imageCount = 1;
}

void KestPictureBuilder::__buildSequence(Evas_Object* pageLayout, const std::string& firstPath,
                                         const std::string& secondPath) {
    Evas_Object* layout = __addImageLayout(pageLayout);
    area.scroller = __createPagingScroller();
    put(layout, "scroller", area.scroller);
    Evas_Object* box = elm_box_add(area.scroller);
    elm_box_horizontal_set(box, EINA_TRUE);
    evas_object_show(box);
    elm_object_content_set(area.scroller, box);
    elm_scroller_page_relative_set(area.scroller, 1.0, 0.0);

    __packPage(box, __createPage(box, firstPath));
    __packPage(box, __createPage(box, secondPath));
    for (std::string path = KestPicturePaths::next(secondPath); KestPicturePaths::isAccessible(path);
         path = KestPicturePaths::next(path)) {
        Evas_Object* page = __createPage(box, path);
        KEST_INFO("NextImagePath is %s", path.c_str());
        __packPage(box, page);
    }
}

Evas_Object* KestPictureBuilder::__addImageLayout(Evas_Object* pageLayout) {
    area.imageLayout = __createLayout(pageLayout, "layout/multi_image");
    put(pageLayout, videoPart, area.imageLayout);
    return area.imageLayout;
}

Evas_Object* KestPictureBuilder::__createPagingScroller() {
    Evas_Object* scroller = elm_scroller_add(area.imageLayout);
    elm_scroller_loop_set(scroller, EINA_FALSE, EINA_FALSE);
    elm_scroller_policy_set(scroller, ELM_SCROLLER_POLICY_OFF, ELM_SCROLLER_POLICY_OFF);
    elm_scroller_page_scroll_limit_set(scroller, 1, 0);
    elm_object_scroll_lock_y_set(scroller, EINA_TRUE);
    // The lock does not keep it from bouncing.
    elm_scroller_bounce_set(scroller, EINA_FALSE, EINA_FALSE);
    elm_scroller_single_direction_set(scroller, ELM_SCROLLER_SINGLE_DIRECTION_HARD);
    // The demonstration pages it, not the user.
    elm_scroller_movement_block_set(scroller, ELM_SCROLLER_MOVEMENT_BLOCK_HORIZONTAL);
    return scroller;
}

void KestPictureBuilder::__packPage(Evas_Object* box, Evas_Object* page) {
    if (page) {
        elm_box_pack_end(box, page);
    }
    ++area.imageCount;
}

Evas_Object* KestPictureBuilder::__createPage(Evas_Object* parent, const std::string& picturePath) {
    KEST_HIT();
    Size size = {__pageWidth(), 0};
    size.height = static_cast<int>(size.width / static_cast<double>(areaWidth) * areaHeight);
    const bool isNarrow = size.width <= leastWidthOfPage;
    if (isNarrow) {
        size.height = heightOfNarrowPage;
    }
    Evas_Object* page = __createLayout(parent, isNarrow ? "layout/multi_image/hpage" : "layout/multi_image/page");
    if (!page) {
        KEST_ERR("create layout is fail");
        return nullptr;
    }
    const std::string touchPath = KestPicturePaths::touch(picturePath);
    const std::string russianPath = KestPicturePaths::russian(picturePath);
    KEST_INFO("imagePath_touch = %s", touchPath.c_str());
    KEST_INFO("imagePath_russia = %s", russianPath.c_str());
    const bool takesRussian = isRussian() && KestPicturePaths::isAccessible(russianPath);
    put(page, "page", __createPicture(page, takesRussian ? russianPath : "", picturePath));
    if (KestPicturePaths::isAccessible(touchPath)) {
        put(page, "page.touch", __createReadableImage(page, touchPath));
    }
    __setSizer(page, size);
    area.addPage(page, picturePath);
    return page;
}

Evas_Object* KestPictureBuilder::__createVerticalPage(Evas_Object* parent, const std::string& imagePath) {
    KEST_HIT();
    Evas_Object* page = __createLayout(parent, "layout/multi_image/page");
    if (!page) {
        KEST_ERR("create layout is fail");
        return nullptr;
    }
    Evas_Object* image = __createImage(page, imagePath);
    if (!image) {
        KEST_ERR("elm_image_add() is failed");
        evas_object_del(page);
        return nullptr;
    }
    elm_object_part_content_set(page, "page", image);

    Size picture = {0, 0};
    elm_image_object_size_get(image, &picture.width, &picture.height);
    Size size = {__pageWidth(), 0};
    if (picture.width > 0) {
        size.height = static_cast<int>(static_cast<std::int64_t>(picture.height) * size.width / picture.width);
    }
    __setSizer(page, isLowDensity() ? Size{-1, size.height - lowDensityCut} : size);
    return page;
}

Evas_Object* KestPictureBuilder::__createPicture(Evas_Object* page, const std::string& variantPath,
                                                 const std::string& picturePath) {
    Evas_Object* image = variantPath.empty() ? nullptr : __createReadableImage(page, variantPath);
    if (!image) {
        image = __createReadableImage(page, picturePath);
    }
    return image ? image : __createImage(page, placeholderPath());
}

Evas_Object* KestPictureBuilder::__createReadableImage(Evas_Object* page, const std::string& path) {
    Evas_Object* image = __createImage(page, path);
    int width = 0;
    int height = 0;
    if (image) {
        elm_image_object_size_get(image, &width, &height);
    }
    const std::int64_t pixels = std::int64_t{width} * height;
    if (pixels > 0 && pixels <= pixelsLeft) {
        pixelsLeft -= pixels;
        return image;
    }
    if (pixels > 0) {
        KEST_WARN("%d x %d pixels are more than the page has left: %s", width, height, path.c_str());
    } else {
        KEST_WARN("no picture: %s", path.c_str());
    }
    evas_object_del(image);
    return nullptr;
}

Evas_Object* KestPictureBuilder::__createImage(Evas_Object* parent, const std::string& path) {
    Evas_Object* image = elm_image_add(parent);
    KEST_INFO("imagePath : %s", path.c_str());
    if (!image) {
        return nullptr;
    }
    __setFile(image, path);
    KestSizeHints::fill(image);
    return image;
}

void KestPictureBuilder::__setFile(Evas_Object* image, const std::string& path) const {
    if (!KestPictureFile::isWhole(path)) {
        KEST_WARN("the file breaks off: %s", path.c_str());
        return;
    }
    // An image is decoded by a thread as soon as it has a file: one refused for its size would take its memory yet.
    elm_image_preload_disabled_set(image, EINA_TRUE);
    elm_image_file_set(image, path.c_str(), nullptr);
    int width = 0;
    int height = 0;
    elm_image_object_size_get(image, &width, &height);
    if (std::int64_t{width} * height > mostPixels) {
        KEST_WARN("%d x %d pixels are too many: %s", width, height, path.c_str());
        elm_image_file_set(image, nullptr, nullptr);
    } else if (width > 0 && height > 0) {
        elm_image_preload_disabled_set(image, EINA_FALSE);
    }
}

void KestPictureBuilder::__setSizer(Evas_Object* page, const Size& least) const {
    Evas_Object* rectangle = evas_object_rectangle_add(evas_object_evas_get(page));
    KestSizeHints::expand(rectangle);
    evas_object_size_hint_min_set(rectangle, least.width, least.height);
    put(page, "sizer", rectangle);
}

Evas_Object* KestPictureBuilder::__createLayout(Evas_Object* parent, const char* group) const {
    Evas_Object* layout = elm_layout_add(parent);
    if (layout) {
        elm_layout_file_set(layout, themeFile.c_str(), group);
        KestSizeHints::expand(layout);
        evas_object_show(layout);
    }
    return layout;
}

int KestPictureBuilder::__pageWidth() const {
    int width = 0;
    elm_win_screen_size_get(window, nullptr, nullptr, &width, nullptr);
    return width - static_cast<int>(elm_config_scale_get() * marginInUnits / elm_app_base_scale_get());
}
