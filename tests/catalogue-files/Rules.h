#pragma once

#include "Catalogue.h"

#include <functional>
#include <optional>
#include <string>
#include <vector>

/// What a schema cannot say of a catalogue. Each rule returns one "file:line: what is wrong" for every place that
/// breaks it; none where it is kept.
namespace catalogue {

using Problems = std::vector<std::string>;

/// The texts that tips need not bring themselves: nullopt for an id that is not among them.
using SharedTexts = std::function<std::optional<std::string>(const std::string& language, const std::string& id)>;

/// A text as the application looks it up: shared texts first, then the tip's own by "ko_KR", then by "ko".
std::optional<std::string> textIn(const std::string& language, const Tip& tip, const std::string& id,
                                  const SharedTexts& shared);

/// The contents are written as the catalogue reads them, and do not name the tip's title.
Problems contentsAreWellWritten(const Tip& tip);

/// Every id that the tip uses has a text in every language, and its string file has no text that nobody uses.
Problems idsAreTranslated(const Tip& tip, const std::vector<std::string>& languages, const SharedTexts& shared);

/// A translation into a language that has letters of its own holds some of them, so that none is left in English.
Problems translationsHaveLettersOfTheirLanguage(const Tip& tip);

/// Titles are one plain line, and contents are balanced markup with each attachment once, in every language.
Problems translationsFitTheirPlace(const Tip& tip, const std::vector<std::string>& languages,
                                   const SharedTexts& shared);

/// The picture and the files that the markup refers to lie in the application's shared resources.
Problems filesExist(const Tip& tip);

/// No two tips share what is kept of a tip: its path, as the cache spells it.
Problems pathsAreUnique(const std::vector<Tip>& tips);

/// A string id means the same in every string file, since all of them end in one table.
Problems stringsAgree(const std::vector<Tip>& tips);

/// At most 15 tips are offered in a region: there is room for no more pages.
Problems regionsAreNotTooFull(const std::vector<Tip>& tips);

/// How many tips are offered in a region.
std::size_t tipsIn(const std::string& region, const std::vector<Tip>& tips);

}  // namespace catalogue
