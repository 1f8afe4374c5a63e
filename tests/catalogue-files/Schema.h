#pragma once

#include <filesystem>
#include <string>
#include <vector>

namespace catalogue {

/// What docs/schemas/`schema` says against a text that is called `name`: one "name:line: what is wrong" a line, in the
/// order found. A text that is not well formed gives the parser's one line.
/// Throws std::runtime_error when the schema itself cannot be read.
std::vector<std::string> schemaProblems(const std::filesystem::path& schema, const std::string& text,
                                        const std::string& name);

}  // namespace catalogue
