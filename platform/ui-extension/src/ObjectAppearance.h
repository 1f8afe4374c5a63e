#pragma once

#include "ClassSet.h"

#include <functional>

namespace uxt {

/// Colours and fonts of one object and of the layouts inside it, also of those that come later. The layouts below an
/// object that has an appearance of its own are that one's.
class ObjectAppearance {
public:
    explicit ObjectAppearance(Evas_Object* object);
    ~ObjectAppearance();
    ObjectAppearance(const ObjectAppearance&) = delete;
    ObjectAppearance& operator=(const ObjectAppearance&) = delete;

    /// Live layouts change at once.
    void set(ClassSet classes);

private:
    static void beforeFrame(void* self, Evas*, void*);
    void watchForNewLayouts(bool watch);
    /// False when there were none.
    bool adoptNewLayouts();
    void adopt(Evas_Object* layout);
    void forEachLayout(Evas_Object* object, const std::function<void(Evas_Object*)>& visit) const;

    Evas_Object* object_;
    ClassSet classes_;
    bool watches_ = false;
};

}  // namespace uxt
