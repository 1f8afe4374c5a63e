#pragma once

#include <libxml/tree.h>

#include <map>
#include <string>

/// The translations that the string files of the catalogue give, by language and string id. Never forgets one: a
/// later file of the same language and id overwrites it.
class KestStringTable {
public:
    /// Takes over the "item" elements of a string file's "items": their "region", "stringid" and "value". One
    /// without an id is left out.
    void addAll(const xmlNode* items);

    /// `language` as the setting has it ("ko_KR.UTF-8"): the country's entry comes before the language's.
    /// Null when there is neither.
    const std::string* find(const std::string& language, const std::string& id) const;

private:
    void __add(const xmlNode* item);

    /// By region + "_" + string id.
    std::map<std::string, std::string> values;
};
