#include "ui/Picture.h"

#include "ui/Screen.h"

#include <Ecore_Evas.h>

#include <set>

namespace test_ui {

Picture::Picture(int width, int height, const unsigned int* pixels)
    : width_(pixels ? width : 0), height_(pixels ? height : 0),
      pixels_(pixels, pixels + static_cast<size_t>(width_) * static_cast<size_t>(height_)) {}

unsigned int Picture::pixel(int x, int y) const {
    if (x < 0 || y < 0 || x >= width_ || y >= height_)
        return 0;
    return pixels_[static_cast<size_t>(y) * static_cast<size_t>(width_) + static_cast<size_t>(x)] & 0xffffff;
}

int Picture::count(unsigned int colour, const Rect& area) const {
    int found = 0;
    for (int y = area.y; y < area.y + area.height; ++y)
        for (int x = area.x; x < area.x + area.width; ++x)
            found += pixel(x, y) == colour;
    return found;
}

int Picture::colours(const Rect& area) const {
    std::set<unsigned int> seen;
    for (int y = area.y; y < area.y + area.height; ++y)
        for (int x = area.x; x < area.x + area.width; ++x)
            seen.insert(pixel(x, y));
    return static_cast<int>(seen.size());
}

bool Picture::save(const std::filesystem::path& file) const {
    Ecore_Evas* frame = ecore_evas_buffer_new(1, 1);
    if (!frame)
        return false;
    Evas_Object* image = evas_object_image_add(ecore_evas_get(frame));
    evas_object_image_size_set(image, width_, height_);
    evas_object_image_alpha_set(image, EINA_FALSE);
    evas_object_image_data_copy_set(image, const_cast<unsigned int*>(pixels_.data()));
    const bool saved = evas_object_image_save(image, file.c_str(), nullptr, nullptr);
    ecore_evas_free(frame);
    return saved;
}

}  // namespace test_ui
