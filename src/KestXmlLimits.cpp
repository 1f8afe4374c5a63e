#include "KestXmlLimits.h"

#include "KestMarkup.h"

namespace {

/// The parser compares every attribute of a tag with all the others, and every prefix with all namespaces in force.
const size_t mostAttributes = 256;
const size_t mostNamespaces = 256;

/// A tag of four bytes becomes an element of more than a hundred.
const size_t mostTags = 3000000;

/// What entities stand for may hold tags that nobody can count without expanding them.
const size_t longestWithDocumentType = 64 * 1024;

/// Attributes are values in quotes between a "<" and its ">". A value cannot hold a "<", so each begins anew.
bool hasTooMuchMarkup(const std::string& text) {
    size_t tags = 0;
    size_t attributes = 0;
    char quote = '\0';
    bool inTag = false;
    for (const char character : text) {
        if (character == '<') {
            inTag = true;
            quote = '\0';
            attributes = 0;
            if (++tags > mostTags) {
                return true;
            }
        } else if (!inTag) {
            continue;
        } else if (quote) {
            quote = character == quote ? '\0' : quote;
        } else if (character == '>') {
            inTag = false;
        } else if (character == '"' || character == '\'') {
            quote = character;
            if (++attributes > mostAttributes) {
                return true;
            }
        }
    }
    return false;
}

bool hasTooManyNamespaces(const std::string& text) {
    const std::string declaration = "xmlns";
    size_t count = 0;
    for (size_t at = KestMarkup::find(text, declaration, 0); at != std::string::npos && count <= mostNamespaces;
         at = KestMarkup::find(text, declaration, at + declaration.size())) {
        ++count;
    }
    return count > mostNamespaces;
}

bool declaresParameterEntity(const std::string& text) {
    const std::string declaration = "<!ENTITY";
    for (size_t at = KestMarkup::find(text, declaration, 0); at != std::string::npos;
         at = KestMarkup::find(text, declaration, at + 1)) {
        const size_t name = text.find_first_not_of(" \t\r\n", at + declaration.size());
        if (name != std::string::npos && text[name] == '%') {
            return true;
        }
    }
    return false;
}

/// Attributes that are declared come with every element, and parameter entities hide what is declared.
bool hasBadDocumentType(const std::string& text) {
    if (KestMarkup::find(text, "<!DOCTYPE", 0) == std::string::npos) {
        return false;
    }
    return text.size() > longestWithDocumentType || KestMarkup::find(text, "<!ATTLIST", 0) != std::string::npos ||
           declaresParameterEntity(text);
}

}  // namespace

const size_t KestXmlLimits::longestFile;

bool KestXmlLimits::accept(const std::string& text) {
    return text.size() <= longestFile && !hasBadDocumentType(text) && !hasTooMuchMarkup(text) &&
           !hasTooManyNamespaces(text);
}
