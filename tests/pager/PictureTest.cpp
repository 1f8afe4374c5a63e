#include "PictureTest.h"

#include <fstream>
#include <unistd.h>

std::string PictureTest::groupOf(Evas_Object* layout) {
    const char* group = nullptr;
    elm_layout_file_get(layout, nullptr, &group);
    return group ? group : "";
}

std::string PictureTest::fileIn(Evas_Object* layout, const char* part) {
    const Evas_Object* image = elm_object_part_content_get(layout, part);
    return image ? fileOf(image) : "";
}

std::vector<std::string> PictureTest::filesIn(const std::vector<Evas_Object*>& layouts, const char* part) {
    std::vector<std::string> files;
    files.reserve(layouts.size());
    for (Evas_Object* layout : layouts)
        files.push_back(fileIn(layout, part));
    return files;
}

PictureTest::Size PictureTest::sizeOf(Evas_Object* layout) {
    Size size{};
    evas_object_size_hint_min_get(elm_object_part_content_get(layout, "sizer"), &size.width, &size.height);
    return size;
}

std::size_t PictureTest::memory() {
    std::ifstream stream("/proc/self/statm");
    std::size_t whole = 0, resident = 0;
    stream >> whole >> resident;
    return resident * static_cast<std::size_t>(sysconf(_SC_PAGESIZE));
}
