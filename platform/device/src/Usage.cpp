#include "device/Usage.h"

#include "JsonText.h"
#include "device/Database.h"

namespace device {

long long Usage::append(const std::string& uri, const std::vector<std::pair<std::string, std::string>>& values) {
    return database_.guarded([&] {
        SQLite::Statement insert(database_.sql(), "INSERT INTO usage (time, uri, record) "
                                                  "VALUES (strftime('%Y-%m-%dT%H:%M:%fZ', 'now'), ?, " +
                                                      jsonObjectOf(values.size()) + ")");
        int index = 0;
        insert.bind(++index, uri);
        bindPairs(insert, index, values);
        insert.exec();
        return static_cast<long long>(database_.sql().getLastInsertRowid());
    });
}

std::vector<UsageRecord> Usage::all() const {
    return database_.guarded([&] {
        std::vector<UsageRecord> records;
        const auto row =
            database_.query("SELECT usage.id, usage.time, usage.uri, each.key, each.value "
                            "FROM usage LEFT JOIN json_each(usage.record) AS each ORDER BY usage.id, each.id");
        while (row->executeStep()) {
            const long long id = row->getColumn(0).getInt64();
            if (records.empty() || records.back().id != id)
                records.push_back({id, row->getColumn(1).getString(), row->getColumn(2).getString(), {}});
            if (!row->isColumnNull(3))
                records.back().values.emplace_back(row->getColumn(3).getString(), row->getColumn(4).getString());
        }
        return records;
    });
}

}  // namespace device
