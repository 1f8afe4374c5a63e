#pragma once

#include <filesystem>
#include <libxml/tree.h>
#include <memory>
#include <string>
#include <vector>

namespace catalogue {

struct FreeDocument {
    void operator()(xmlDoc* document) const { xmlFreeDoc(document); }
};
using Document = std::unique_ptr<xmlDoc, FreeDocument>;

/// Reads a file. Throws std::runtime_error, with file and line, when it is not well formed.
Document readDocument(const std::filesystem::path& file);
/// Reads a text that is called `name` in messages.
Document readDocument(const std::string& text, const std::string& name);

/// The element's children of that name, in document order.
std::vector<xmlNode*> childrenNamed(const xmlNode* element, const char* name);
/// The first of them, or nullptr; also when `element` is nullptr.
xmlNode* childNamed(const xmlNode* element, const char* name);
/// Everything that is text below the element; "" for nullptr.
std::string textOf(const xmlNode* element);
/// "" when there is no such attribute or no element.
std::string attributeOf(const xmlNode* element, const char* name);

}  // namespace catalogue
