#pragma once

#include <SQLiteCpp/Statement.h>

#include <string>
#include <utility>
#include <vector>

namespace device {

/// Pairs of strings in one column, as a JSON object. SQLite makes and reads the text: it keeps bytes that are not
/// UTF-8, which a JSON library refuses.
using TextPairs = std::vector<std::pair<std::string, std::string>>;

/// The SQL expression for an object of that many pairs; each takes two parameters.
std::string jsonObjectOf(std::size_t pairs);

/// Binds them from the parameter after `index` on, and leaves `index` at the last one.
void bindPairs(SQLite::Statement& statement, int& index, const TextPairs& pairs);

}  // namespace device
