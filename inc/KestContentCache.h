#pragma once

#include "KestContentInfo.h"

#include <cstdint>
#include <string>

/// The catalogue's cache in the application's preferences: what it is valid for, and nine fields of every record
/// under a key base made from its path. Failing writes are ignored.
class KestContentCache {
public:
    /// Stores the record's cached fields.
    static void save(const KestContentInfo& record);
    /// Puts the fields cached for `path` into `record`; one that is absent or empty leaves the record's as it is.
    static void load(const std::string& path, KestContentInfo& record);
    /// How many bytes the record's cached fields have.
    static std::uint64_t sizeOf(const KestContentInfo& record);
    /// Empties them, but for the icon's path.
    static void dropTexts(KestContentInfo& record);

    /// Display language and package version that the cache was built for. False when the key cannot be read.
    static bool readLanguage(std::string& language);
    static bool readVersion(std::string& version);
    static void writeLanguage(const std::string& language);
    static void writeVersion(const std::string& version);
};
