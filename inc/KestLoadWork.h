#pragma once

#include "KestProcessorTime.h"

#include <cstddef>
#include <cstdint>

/// What one load of the catalogue may still do, so that it ends on any input: files can refer to themselves, and
/// any number of menus to the same file. A catalogue that is meant to be read needs a hundredth of it.
/// Whoever asks for more than is left takes what is left: the load does not go on with many things that are refused.
/// What takes longer than was thought ends by the clock: nothing is left after ten seconds of the processor's time.
class KestLoadWork {
public:
    KestLoadWork();

    /// What moving so many bytes of text costs, beside handling them.
    static std::uint64_t ofMoving(std::uint64_t bytes) { return bytes / 16; }
    /// Where the text is full of what is nearly searched.
    static std::uint64_t ofSearching(std::uint64_t bytes) { return bytes * 4; }
    /// A text is searched, looked up, marked up and copied so many times until it is translated.
    static std::uint64_t ofTranslating(std::uint64_t bytes) { return bytes * 32; }

    /// Begins the next menu's files, which have a share of their own: a text that uses it up does not spoil the others.
    void beginDetail();
    /// Takes the work of handling one text: of so many bytes in all. False when there is not as much left.
    bool spendOnText(std::uint64_t bytes);
    /// Takes the reading and parsing of a file of so many bytes.
    bool spendOnFile(std::uint64_t bytes);
    /// Takes the place of so many bytes of text that are kept when the load is over.
    bool spendOnKeeping(std::uint64_t bytes);
    bool keepsMore() const { return keptBytes > 0; }

private:
    bool __take(std::uint64_t& left, std::uint64_t amount);

    KestProcessorTime time;
    // More than a 32-bit device can count in a size_t.
    std::uint64_t textBytes;
    std::uint64_t detailTextBytes;
    std::uint64_t fileBytes;
    std::uint64_t keptBytes;
};
