#pragma once

#include <cstddef>
#include <cstdint>
#include <string>

/// Whether the parser can be trusted with a file's text. It takes time that grows with the square of some counts, and
/// within a few kilobytes of declarations a document can ask for gigabytes. Static; holds no state.
class KestXmlLimits {
public:
    /// No file of a catalogue is longer.
    static const size_t longestFile = 16 * 1024 * 1024;

    /// False for a text that has more than three million tags; that is longer than 64 KiB and has a document type or
    /// namespaces; that has both, or declares attributes or parameter entities; and for one that is heavier than 64
    /// MiB. Else `weight` is what parsing it takes beside going through it, in bytes of text that take as long.
    static bool accept(const std::string& text, std::uint64_t& weight);
};
