#include "Appearance.h"

#include "Log.h"
#include "ui_extension.h"

#include <algorithm>
#include <stdexcept>
#include <utility>

namespace uxt {
namespace {

template <typename Table>
auto find(const std::vector<std::unique_ptr<Table>>& tables, const Table* table) {
    return std::find_if(tables.begin(), tables.end(), [table](const auto& each) { return each.get() == table; });
}

/// Lays `over` above `under`.
template <typename Map>
Map layered(const Map& over, const Map& under) {
    Map all = over;
    all.insert(under.begin(), under.end());
    return all;
}

}  // namespace

Appearance& Appearance::ofProcess() {
    static Appearance appearance;
    return appearance;
}

void Appearance::setDevice(DeviceColours colours, bool isDark) {
    device_ = std::move(colours);
    deviceIsDark_ = isDark;
    refresh();
}

uxt_color_table* Appearance::add(uxt_color_table table) {
    return colourTables_.emplace_back(std::make_unique<uxt_color_table>(std::move(table))).get();
}

uxt_font_table* Appearance::add(uxt_font_table table) {
    return fontTables_.emplace_back(std::make_unique<uxt_font_table>(std::move(table))).get();
}

bool Appearance::remove(const uxt_color_table* table) {
    return removeFrom(colourTables_, table, &TableChoice::colours);
}

bool Appearance::remove(const uxt_font_table* table) {
    return removeFrom(fontTables_, table, &TableChoice::fonts);
}

template <typename Table>
bool Appearance::removeFrom(std::vector<std::unique_ptr<Table>>& tables, const Table* table,
                            const Table* TableChoice::*place) {
    const auto found = find(tables, table);
    if (found == tables.end())
        return false;
    bool isUsed = false;
    const auto forget = [&](TableChoice& choice) {
        if (choice.*place != table)
            return;
        choice.*place = nullptr;
        isUsed = true;
    };
    forget(application_);
    for (auto& [object, own] : objects_)
        forget(own.choice);
    tables.erase(found);
    if (isUsed)
        refresh();
    return true;
}

void Appearance::choose(Evas_Object* object, const std::function<void(TableChoice&)>& change) {
    const auto known = objects_.find(object);
    TableChoice choice = !object ? application_ : known == objects_.end() ? TableChoice{} : known->second.choice;
    change(choice);
    check(choice);
    if (!object) {
        application_ = choice;
        refresh();
        return;
    }
    Object& own = objectFor(object);
    own.choice = choice;
    own.appearance->set(classesOf(choice));
}

Appearance::Object& Appearance::objectFor(Evas_Object* object) {
    const auto [place, isNew] = objects_.try_emplace(object);
    if (isNew) {
        place->second.appearance = std::make_unique<ObjectAppearance>(object);
        evas_object_event_callback_add(object, EVAS_CALLBACK_DEL, objectDeleted, this);
    }
    return place->second;
}

void Appearance::objectDeleted(void* self, Evas*, Evas_Object* object, void*) {
    guarded("an object's colours", [&] { static_cast<Appearance*>(self)->objects_.erase(object); });
}

void Appearance::check(const TableChoice& choice) const {
    if (choice.colours && find(colourTables_, choice.colours) == colourTables_.end())
        throw std::invalid_argument("there is no such colour table");
    if (choice.fonts && find(fontTables_, choice.fonts) == fontTables_.end())
        throw std::invalid_argument("there is no such font table");
    if (choice.style && (*choice.style < UXT_THEME_STYLE_LIGHT || *choice.style > UXT_THEME_STYLE_DEVICE))
        throw std::invalid_argument("there is no style " + std::to_string(*choice.style));
}

void Appearance::refresh() {
    const ClassSet before = std::exchange(applied_, classesOfProcess());
    applyToProcess(before, applied_);
    for (auto& [object, own] : objects_)
        own.appearance->set(classesOf(own.choice));
}

bool Appearance::isDark(const TableChoice& choice) const {
    const int style = choice.style.value_or(application_.style.value_or(UXT_THEME_STYLE_DEVICE));
    return style == UXT_THEME_STYLE_DEVICE ? deviceIsDark_ : style == UXT_THEME_STYLE_DARK;
}

ClassSet Appearance::classesOfProcess() const {
    if (!application_.enabled)
        return {device_.of(deviceIsDark_), {}};
    return classesOf(application_);
}

ClassSet Appearance::classesOf(const TableChoice& choice) const {
    if (!choice.enabled)
        return {};
    const bool dark = isDark(choice);
    const auto* colours = choice.colours ? choice.colours : application_.colours;
    const auto* fonts = choice.fonts ? choice.fonts : application_.fonts;
    return {layered(colours ? colours->of(dark) : Colours{}, device_.of(dark)), fonts ? fonts->fonts : Fonts{}};
}

}  // namespace uxt
