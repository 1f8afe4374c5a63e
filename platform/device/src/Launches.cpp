#include "device/Launches.h"

#include "JsonText.h"
#include "device/Database.h"

#include <algorithm>
#include <iterator>

namespace device {
namespace {

constexpr const char* names[] = {"asked", "started", "handed over", "failed"};

/// What a newer program may have written counts as one whose end is not known.
LaunchOutcome outcomeNamed(const std::string& name) {
    const auto found = std::find(std::begin(names), std::end(names), name);
    return found == std::end(names) ? LaunchOutcome::Asked : static_cast<LaunchOutcome>(found - std::begin(names));
}

}  // namespace

const char* Launches::nameOf(LaunchOutcome outcome) {
    return names[static_cast<std::size_t>(outcome)];
}

long long Launches::append(const LaunchRequest& request, LaunchOutcome outcome, const std::string& reason) {
    return database_.guarded([&] {
        SQLite::Statement insert(database_.sql(), "INSERT INTO launch (time, caller, app_id, extras, outcome, reason) "
                                                  "VALUES (strftime('%Y-%m-%dT%H:%M:%fZ', 'now'), ?, ?, " +
                                                      jsonObjectOf(request.extras.size()) + ", ?, ?)");
        int index = 0;
        insert.bind(++index, request.caller);
        insert.bind(++index, request.appId);
        bindPairs(insert, index, request.extras);
        insert.bind(++index, nameOf(outcome));
        insert.bind(++index, reason);
        insert.exec();
        return static_cast<long long>(database_.sql().getLastInsertRowid());
    });
}

void Launches::update(long long id, LaunchOutcome outcome, const std::string& reason) {
    database_.guarded([&] {
        database_
            .query("UPDATE launch SET outcome = ?, reason = ? WHERE id = ?", nameOf(outcome), reason,
                   static_cast<std::int64_t>(id))
            ->exec();
    });
}

std::vector<LaunchRecord> Launches::all() const {
    return database_.guarded([&] {
        std::vector<LaunchRecord> records;
        const auto row = database_.query(
            "SELECT launch.id, launch.time, launch.caller, launch.app_id, launch.outcome, launch.reason, each.key, "
            "each.value FROM launch LEFT JOIN json_each(launch.extras) AS each ORDER BY launch.id, each.id");
        while (row->executeStep()) {
            const long long id = row->getColumn(0).getInt64();
            if (records.empty() || records.back().id != id)
                records.push_back({id,
                                   row->getColumn(1).getString(),
                                   {row->getColumn(2).getString(), row->getColumn(3).getString(), {}},
                                   outcomeNamed(row->getColumn(4).getString()),
                                   row->getColumn(5).getString()});
            if (!row->isColumnNull(6))
                records.back().request.extras.emplace_back(row->getColumn(6).getString(),
                                                           row->getColumn(7).getString());
        }
        return records;
    });
}

}  // namespace device
