#pragma once

#include "CatalogueTest.h"
#include "PreferenceCalls.h"

/// The catalogue's cache in the preferences.
class Cache : public CatalogueTest {
protected:
    Cache() { preference_calls::isListening = true; }
    ~Cache() override {
        preference_calls::isListening = false;
        preference_calls::meanwhile.clear();
    }

    /// A cache of the catalogue as the device is now, of one tip.
    void fill() {
        loadTip("<title>Cached</title>");
        preference_calls::written.clear();
        preference_calls::asked.clear();
    }
    /// What the next start of the application loads.
    std::vector<KestContentInfo> loadAtNextStart() { return load(false); }
    /// A load from the files leaves this trace, one from the cache does not.
    bool loadedFromFiles() const {
        return testing::Value(log(), testing::Contains(manager_log::begin("__loadDetailMenu")));
    }
};
