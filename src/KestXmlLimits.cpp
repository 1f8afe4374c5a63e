#include "KestXmlLimits.h"

#include "KestMarkup.h"

#include <algorithm>
#include <cctype>

namespace {

/// A tag of four bytes becomes an element of more than a hundred.
const size_t mostTags = 3000000;

/// What entities stand for may hold tags that nobody can count without expanding them. Names are looked up in all
/// namespaces, letter by letter, and messages about them quote all of a namespace. No catalogue has a use for either.
const size_t longestWithDeclarations = 64 * 1024;

const std::uint64_t heaviest = 64 * 1024 * 1024;

/// A comparison takes a third of the time that a byte of text does.
const std::uint64_t comparisonsOfByte = 2;

/// So many bytes are copied, and measured, while one is parsed.
const std::uint64_t copiesOfByte = 8;

/// The shortest attribute: a blank, a letter, "=" and two quotes.
const std::uint64_t shortestAttribute = 5;

/// Every attribute of a tag is compared with those before it.
std::uint64_t comparisonsOf(std::uint64_t attributes) {
    return attributes * attributes / 2;
}

/// Counts what the parser compares: the attributes of each tag with each other.
/// Nothing is taken for a comment or a section: where one ends the parser, which goes on after errors, may see it
/// otherwise. A tag ends at its ">" or at the next "<", since no attribute's value can hold that, and every attribute
/// has a value in quotes after a "=". So the parser never finds more than is counted here, wherever it finds tags.
class Comparisons {
public:
    explicit Comparisons(const std::string& whole) : text(whole) {}

    /// False where there are more tags than any catalogue has.
    bool count() {
        for (size_t at = text.find('<'); at != std::string::npos && tags <= mostTags; at = text.find('<', at)) {
            ++tags;
            at = __readTag(at + 1);
        }
        return tags <= mostTags;
    }

    std::uint64_t inAll() const { return ofAttributes; }

private:
    /// From behind its "<"; where it ends.
    size_t __readTag(size_t at) {
        std::uint64_t attributes = 0;
        bool beforeValue = false;
        for (; at < text.size() && text[at] != '<' && text[at] != '>'; ++at) {
            const char character = text[at];
            if (beforeValue && (character == '"' || character == '\'')) {
                ++attributes;
                at = __endOfValue(at);
            }
            beforeValue = character == '=' || (beforeValue && std::isspace(static_cast<unsigned char>(character)));
        }
        ofAttributes += comparisonsOf(attributes);
        return at;
    }

    /// The closing quote, or where a value breaks off that has none.
    size_t __endOfValue(size_t at) const {
        const char end[] = {text[at], '<', '\0'};
        const size_t found = text.find_first_of(end, at + 1);
        return found == std::string::npos ? text.size() - 1 : found - (text[found] == '<' ? 1 : 0);
    }

    const std::string& text;
    std::uint64_t tags = 0;
    std::uint64_t ofAttributes = 0;
};

/// A "--" in a comment is an error whose message quotes the comment so far, all of it. Two dashes and a ">" end it in
/// every case; whether more dashes do is a matter of how the parser pairs them.
std::uint64_t bytesQuotedFromComments(const std::string& text) {
    std::uint64_t bytes = 0;
    size_t begin = std::string::npos;
    size_t end = 0;
    for (size_t at = text.find("--"); at != std::string::npos; at = text.find("--", end)) {
        end = std::min(text.find_first_not_of('-', at), text.size());
        const bool opens = at >= 2 && text.compare(at - 2, 2, "<!") == 0;
        const size_t dashes = end - at - (opens ? 2 : 0);
        const bool closes = dashes == 2 && end < text.size() && text[end] == '>';
        if (begin == std::string::npos) {
            begin = opens && !closes ? at : begin;
            bytes += std::uint64_t{dashes} * dashes;
        } else if (closes && !opens) {
            begin = std::string::npos;
        } else {
            bytes += std::uint64_t{end - at} * (end - begin);
        }
    }
    return bytes;
}

bool contains(const std::string& text, const char* what) {
    return KestMarkup::find(text, what, 0) != std::string::npos;
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

/// Attributes that are declared come with every element, and parameter entities hide what is declared. An entity in a
/// namespace is parsed anew each time that it is referred to, with all that is nested in it.
bool isBadDocumentType(const std::string& text) {
    return contains(text, "<!ATTLIST") || declaresParameterEntity(text) || contains(text, "xmlns");
}

}  // namespace

const size_t KestXmlLimits::longestFile;

bool KestXmlLimits::accept(const std::string& text, std::uint64_t& weight) {
    const bool hasDocumentType = contains(text, "<!DOCTYPE");
    if (hasDocumentType || contains(text, "xmlns")) {
        // Entities can stand for attributes, one after the other, that are in none of its tags.
        weight = comparisonsOf(text.size() / shortestAttribute) / comparisonsOfByte;
        return text.size() <= longestWithDeclarations && !(hasDocumentType && isBadDocumentType(text));
    }
    Comparisons comparisons(text);
    const bool readable = comparisons.count();
    weight = comparisons.inAll() / comparisonsOfByte + bytesQuotedFromComments(text) / copiesOfByte;
    return readable && weight <= heaviest;
}
