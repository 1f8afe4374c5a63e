#pragma once

#include "KestStringTable.h"

#include <string>

/// Finds the translation of a string id: in the text domain of a menu, in the application's own, in the device's, and
/// in the catalogue's string files.
class KestTranslator {
public:
    KestTranslator();

    /// Asks the device for the display language again, when a text is looked for in the string files. It is asked until
    /// it answers.
    void forgetLanguage() { hasDisplayLanguage = false; }

    /// Whether translate() would find a translation.
    bool knows(const std::string& id, const std::string& domain) const;
    /// The translation, else the id itself.
    std::string translate(const std::string& id, const std::string& domain) const;

    KestStringTable& strings() { return stringTable; }

private:
    /// Null when no string file has the id in the display language.
    const std::string* __findInStrings(const std::string& id) const;

    KestStringTable stringTable;
    /// As the device told it, once it did.
    mutable std::string displayLanguage;
    mutable bool hasDisplayLanguage;
};
