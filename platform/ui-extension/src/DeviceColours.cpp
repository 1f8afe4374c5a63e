#include "DeviceColours.h"

#include <Edje.h>

#include <cstdlib>
#include <memory>
#include <stdexcept>

namespace uxt {
namespace {

struct CloseFile {
    void operator()(Eina_File* file) const { eina_file_close(file); }
};
struct FreeIterator {
    void operator()(Eina_Iterator* iterator) const { eina_iterator_free(iterator); }
};

Colour darkColour(const std::string& themeFile, const std::string& name) {
    const std::string key = "dark:" + name;
    const std::unique_ptr<char, decltype(&std::free)> text(edje_file_data_get(themeFile.c_str(), key.c_str()),
                                                           std::free);
    const auto colour = text ? Colour::parse(text.get()) : std::nullopt;
    if (!colour)
        throw std::runtime_error(themeFile + ": error: the data item \"" + key + "\" is no colour");
    return *colour;
}

}  // namespace

DeviceColours DeviceColours::read(const std::string& themeFile) {
    const std::unique_ptr<Eina_File, CloseFile> file(eina_file_open(themeFile.c_str(), EINA_FALSE));
    const std::unique_ptr<Eina_Iterator, FreeIterator> classes(file ? edje_mmap_color_class_iterator_new(file.get())
                                                                    : nullptr);
    if (!classes)
        throw std::runtime_error(themeFile + ": error: is no theme file");
    DeviceColours colours;
    void* each = nullptr;
    while (eina_iterator_next(classes.get(), &each)) {
        const auto* colourClass = static_cast<const Edje_Color_Class*>(each);
        colours.light[colourClass->name] = {colourClass->r, colourClass->g, colourClass->b, colourClass->a};
        colours.dark[colourClass->name] = darkColour(themeFile, colourClass->name);
    }
    return colours;
}

}  // namespace uxt
