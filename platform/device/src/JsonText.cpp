#include "JsonText.h"

namespace device {

std::string jsonObjectOf(std::size_t pairs) {
    if (pairs == 0)
        return "'{}'";
    std::string rows;
    for (std::size_t row = 0; row < pairs; ++row)
        rows += row == 0 ? "(?, ?)" : ", (?, ?)";
    return "(SELECT json_group_object(column1, column2) FROM (VALUES " + rows + "))";
}

void bindPairs(SQLite::Statement& statement, int& index, const TextPairs& pairs) {
    for (const auto& [key, value] : pairs) {
        statement.bind(++index, key);
        statement.bind(++index, value);
    }
}

}  // namespace device
