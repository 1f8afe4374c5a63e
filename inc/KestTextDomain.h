#pragma once

#include <string>

/// gettext domains whose names come from the catalogue. For gettext such a name is a file's, which it keeps on the
/// stack: one with a slash, or longer than a file's name can be, is no domain and has no texts. Nor has one that comes
/// after 250 others. Static.
class KestTextDomain {
public:
    /// Whether the domain translates `id` into something else.
    static bool hasText(const std::string& domain, const std::string& id);
    static void bind(const std::string& domain, const char* directory);
};
