#pragma once

#include <optional>
#include <string>
#include <string_view>

/// Makes service calls fail on purpose, by name and count, so that every failure that an application promises
/// to survive can be made to happen. Costs one comparison while nothing is set up.
namespace device::faults {

/// Lets calls of `service` (the public function's name, for example "preference_set_string") fail: the first
/// `skip` calls go through, then `count` calls fail with `error`. A second plan for the same name replaces the first;
/// a count of 0 forgets it.
void plan(std::string_view service, int error, int count = 1, int skip = 0);
/// Forgets all plans.
void clear();
/// Sets up plans from text: "NAME=ERROR[xCOUNT][+SKIP]", comma-separated. Read from $DEVICE_FAULTS at start.
/// Throws Error that names the faulty word.
void planFromText(std::string_view text);

/// Called by each service first: the error that this call shall fail with, or nullopt.
std::optional<int> take(std::string_view service) noexcept;

}  // namespace device::faults
