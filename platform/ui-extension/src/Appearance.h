#pragma once

#include "DeviceColours.h"
#include "ObjectAppearance.h"

#include <Evas.h>

#include <functional>
#include <map>
#include <memory>
#include <optional>
#include <vector>

namespace uxt {

/// What the application, or one of its objects, asked of the tables. What an object leaves open the application says.
struct TableChoice {
    bool enabled = false;
    std::optional<int> style;
    const uxt_color_table* colours = nullptr;
    const uxt_font_table* fonts = nullptr;
};

/// The process's appearance: the device's colours, the tables that the application added, and where they apply.
/// Whatever is set, live layouts change at once.
class Appearance {
public:
    static Appearance& ofProcess();

    /// The colours that the device's own widget styles have, and which of them its theme asks for.
    void setDevice(DeviceColours colours, bool isDark);

    uxt_color_table* add(uxt_color_table table);
    uxt_font_table* add(uxt_font_table table);
    /// False when there is no such table.
    bool remove(const uxt_color_table* table);
    bool remove(const uxt_font_table* table);

    /// Changes what is asked for, for one object or (null) for the application, and applies it.
    /// Throws std::invalid_argument when a table is none, or a style is none of 0, 1 and 2.
    void choose(Evas_Object* object, const std::function<void(TableChoice&)>& change);

    /// Applies everything anew.
    void refresh();

private:
    struct Object {
        TableChoice choice;
        std::unique_ptr<ObjectAppearance> appearance;
    };

    template <typename Table>
    bool removeFrom(std::vector<std::unique_ptr<Table>>& tables, const Table* table, const Table* TableChoice::*place);
    static void objectDeleted(void* self, Evas*, Evas_Object* object, void*);
    Object& objectFor(Evas_Object* object);
    void check(const TableChoice& choice) const;
    bool isDark(const TableChoice& choice) const;
    ClassSet classesOfProcess() const;
    ClassSet classesOf(const TableChoice& choice) const;

    DeviceColours device_;
    bool deviceIsDark_ = false;
    std::vector<std::unique_ptr<uxt_color_table>> colourTables_;
    std::vector<std::unique_ptr<uxt_font_table>> fontTables_;
    TableChoice application_;
    ClassSet applied_;
    std::map<Evas_Object*, Object> objects_;
};

}  // namespace uxt
