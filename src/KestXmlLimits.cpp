#include "KestXmlLimits.h"

#include "KestMarkup.h"

#include <array>

namespace {

/// The parser compares every attribute of a tag with all the others, and every prefix with all namespaces in force.
const size_t mostAttributes = 256;
const size_t mostNamespaces = 256;

/// A tag of four bytes becomes an element of more than a hundred.
const size_t mostTags = 3000000;

/// What entities stand for may hold tags that nobody can count without expanding them.
const size_t longestWithDocumentType = 64 * 1024;

bool hasAt(const std::string& text, size_t at, const std::string& what) {
    return text.compare(at, what.size(), what) == 0;
}

/// Counts tags, and in each its attributes: values in quotes between a "<" and its ">". A value cannot hold a "<", so
/// each begins anew.
class Markup {
public:
    explicit Markup(const std::string& whole) : text(whole) {}

    bool isTooMuch(bool withDocumentType) {
        for (size_t at = 0; at < text.size() && !tooMuch; ++at) {
            if (text[at] == '<') {
                // In a document type the same characters may mean something else.
                at = withDocumentType ? at : __skipSection(at);
                __beginTag();
            } else if (inTag) {
                __read(at);
            }
        }
        return tooMuch;
    }

private:
    /// Where the markup goes on after a section, a comment or an instruction that begins at `at`; `at` itself where
    /// none does, or where it does not end.
    size_t __skipSection(size_t at) {
        for (Section& section : sections) {
            if (section.mayEnd && hasAt(text, at, section.begin)) {
                const size_t end = KestMarkup::find(text, section.end, at);
                section.mayEnd = end != std::string::npos;
                return section.mayEnd ? end : at;
            }
        }
        return at;
    }

    void __beginTag() {
        inTag = true;
        quote = '\0';
        attributes = 0;
        tooMuch = ++tags > mostTags;
    }

    void __read(size_t at) {
        const char character = text[at];
        if (quote) {
            quote = character == quote ? '\0' : quote;
        } else if (character == '>') {
            inTag = false;
        } else if (character == '"' || character == '\'') {
            quote = character;
            tooMuch = ++attributes > mostAttributes;
        } else if (character == 'x' && hasAt(text, at, "xmlns")) {
            tooMuch = ++namespaces > mostNamespaces;
        }
    }

    struct Section {
        std::string begin;
        std::string end;
        bool mayEnd;
    };

    const std::string& text;
    std::array<Section, 3> sections{{{"<![CDATA[", "]]>", true}, {"<!--", "-->", true}, {"<?", "?>", true}}};
    bool inTag = false;
    char quote = '\0';
    bool tooMuch = false;
    size_t tags = 0;
    size_t attributes = 0;
    size_t namespaces = 0;
};

bool hasDocumentType(const std::string& text) {
    return KestMarkup::find(text, "<!DOCTYPE", 0) != std::string::npos;
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
bool isBadDocumentType(const std::string& text) {
    return text.size() > longestWithDocumentType || KestMarkup::find(text, "<!ATTLIST", 0) != std::string::npos ||
           declaresParameterEntity(text);
}

}  // namespace

const size_t KestXmlLimits::longestFile;

bool KestXmlLimits::accept(const std::string& text) {
    const bool withDocumentType = hasDocumentType(text);
    return text.size() <= longestFile && !(withDocumentType && isBadDocumentType(text)) &&
           !Markup(text).isTooMuch(withDocumentType);
}
