#pragma once

#include "support/TemporaryDevice.h"

#include <filesystem>
#include <string>
#include <vector>

namespace bench {

/// A device of its own with a catalogue of `menus` menus about ten applications, every file of the make of
/// those that ship: a page of five texts as long as theirs, translated by a string file with three languages.
/// Its device is the process's from the start, until another one is; its files go with it.
class Catalogue {
public:
    explicit Catalogue(int menus);

    /// The catalogue's files in the order in which a full load reads them.
    const std::vector<std::filesystem::path>& files() const { return files_; }
    support::TemporaryDevice& device() { return device_; }

private:
    void addPage(int number, const std::string& appId);

    support::TemporaryDevice device_;
    std::vector<std::filesystem::path> files_;
};

}  // namespace bench
