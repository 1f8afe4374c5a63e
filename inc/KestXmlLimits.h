#pragma once

#include <string>

/// Whether the parser can be trusted with a file's text. It takes time that grows with the square of some counts, and
/// within a few kilobytes of declarations a document can ask for gigabytes. Static; holds no state.
class KestXmlLimits {
public:
    /// No file of a catalogue is longer.
    static const size_t longestFile = 16 * 1024 * 1024;

    /// False for a text that is too long, has more than three million tags, 256 attributes in one of them or 256
    /// namespaces in all, or a document type that is longer than 64 KiB with its document, or that declares
    /// attributes or parameter entities.
    static bool accept(const std::string& text);
};
