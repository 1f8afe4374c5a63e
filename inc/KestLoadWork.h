#pragma once

#include <cstddef>

/// What one load of the catalogue may still do, so that it ends on any input: files can refer to themselves, and
/// any number of menus to the same file. A catalogue that is meant to be read needs a hundredth of it.
class KestLoadWork {
public:
    KestLoadWork();

    /// Begins the next detail file, which has a share of its own: one that uses it up does not spoil the others.
    void beginDetail();
    /// Takes the work of handling one text: of so many bytes in all. False when there is not as much left.
    bool spendOnText(size_t bytes);
    /// Takes the parsing of a file of so many bytes.
    bool spendOnFile(size_t bytes);

private:
    size_t textBytes;
    size_t detailTextBytes;
    size_t fileBytes;
};
