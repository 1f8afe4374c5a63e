#pragma once

#include <cstddef>
#include <cstdint>

/// What one load of the catalogue may still do, so that it ends on any input: files can refer to themselves, and
/// any number of menus to the same file. A catalogue that is meant to be read needs a hundredth of it.
class KestLoadWork {
public:
    KestLoadWork();

    /// What moving so many bytes of text costs, beside handling them.
    static std::uint64_t ofMoving(std::uint64_t bytes) { return bytes / 16; }

    /// Begins the next detail file, which has a share of its own: one that uses it up does not spoil the others.
    void beginDetail();
    /// Takes the work of handling one text: of so many bytes in all. False when there is not as much left.
    bool spendOnText(std::uint64_t bytes);
    /// Takes the parsing of a file of so many bytes.
    bool spendOnFile(std::uint64_t bytes);

private:
    // More than a 32-bit device can count in a size_t.
    std::uint64_t textBytes;
    std::uint64_t detailTextBytes;
    std::uint64_t fileBytes;
};
