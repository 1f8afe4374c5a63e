#pragma once

#include <functional>
#include <string>
#include <vector>

namespace catalogue {

/// What is wrong with a marked-up text as a textblock reads it: a tag that is not closed or closes another one, an "&"
/// that begins no entity. One line for each, without a place.
std::vector<std::string> markupProblems(const std::string& markup);

/// What is wrong with contents as an author wrote them, before they are translated.
std::vector<std::string> contentsProblems(const std::string& contents);

/// The ids of the text tags in contents, in order.
std::vector<std::string> textIdsOf(const std::string& contents);

/// The files that markup refers to with "href=file:".
std::vector<std::string> filesOf(const std::string& markup);

/// Contents with every text tag replaced by what `translate` gives for its id, made fit for markup as the catalogue
/// does it: a newline becomes a small gap and "&" becomes "&amp;".
std::string translateContents(const std::string& contents,
                              const std::function<std::string(const std::string& id)>& translate);

}  // namespace catalogue
